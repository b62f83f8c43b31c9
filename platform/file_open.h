#pragma once

#include <cstdio>
#include <string>

namespace vrl_platform {

/// Opens a file by its name, with a C mode such as "rb". Null when it cannot be opened, and for a folder.
/// Where the system has no wide calls a wide name is taken as UTF-8.
std::FILE* open_file(const char* path, const char* mode);
std::FILE* open_file(const wchar_t* path, const char* mode);

/// Deletes a file by its wide name. False, and nothing else, when that fails.
bool remove_file(const std::wstring& path);

}  // namespace vrl_platform
