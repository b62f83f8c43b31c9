#pragma once

#include <string>

namespace vrl_platform {

/// UTF-16 units (or whole code points, where `wchar_t` has room for them) as UTF-8.
/// A surrogate without its partner is encoded by itself, in three bytes, so that no path loses a unit.
std::string utf8_from_wide(const std::wstring& text);

/// Narrow text in the system's 8-bit code page as UTF-16 units. On POSIX that code page is UTF-8;
/// conversion ends at the first byte that is no UTF-8.
std::wstring wide_from_code_page(const std::string& text);

}  // namespace vrl_platform
