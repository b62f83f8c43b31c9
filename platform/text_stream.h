#pragma once

#include <memory>
#include <ostream>
#include <string>

namespace vrl_platform {

/// Opens a byte stream on a file that is created or truncated, by its wide name, on which each LF becomes
/// CR LF. The stream is in its failed state when the file cannot be opened.
std::unique_ptr<std::ostream> create_crlf_file(const std::wstring& path);

}  // namespace vrl_platform
