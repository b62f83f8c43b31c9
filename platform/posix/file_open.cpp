#include "platform/file_open.h"

#include <unistd.h>

#include "platform/text_encoding.h"

namespace vrl_platform {

std::FILE* open_file(const wchar_t* path, const char* mode) {
    return std::fopen(utf8_from_wide(path).c_str(), mode);
}

// Not std::remove, which takes an empty folder away, too.
bool remove_file(const std::wstring& path) { return ::unlink(utf8_from_wide(path).c_str()) == 0; }

}  // namespace vrl_platform
