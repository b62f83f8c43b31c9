#pragma once

#include <cstdint>
#include <string>

namespace vrl_platform {

/// Code pages by number. Two numbers stand for what the system uses.
namespace code_page {
inline constexpr std::uint32_t ansi = 0;  ///< the system's 8-bit code page: UTF-8 on POSIX
inline constexpr std::uint32_t oem = 1;   ///< its predecessor from DOS times: 437 on POSIX
inline constexpr std::uint32_t oem_437 = 437;
inline constexpr std::uint32_t utf_8 = 65001;
}  // namespace code_page

/// Narrow text from one code page in another.
///
/// Shape    what the target cannot say, and what is no text in the source, becomes '?'. Text that needs no
///          conversion stays as it is; so does, on POSIX, text from or to a number not named above.
/// Source   the table of code page 437 as published by the Unicode Consortium (VENDORS/MICSFT/PC/CP437.TXT).
std::string convert_code_page(const std::string& text, std::uint32_t from, std::uint32_t to);

}  // namespace vrl_platform
