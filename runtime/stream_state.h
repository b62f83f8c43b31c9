#pragma once

#include <ios>
#include <locale>

namespace qbxV2::detail {

/// Whether `os` prints numbers as the classic locale does by default: decimal, right-aligned, with no width
/// asked for and no sign, base, point or capitals added. What is formatted into a buffer may then stand for
/// what the stream's own operators would give. The precision is not looked at.
inline bool prints_plainly(const std::ios& os) {
    constexpr std::ios_base::fmtflags k_shaping = std::ios_base::basefield | std::ios_base::floatfield |
                                                  std::ios_base::adjustfield | std::ios_base::showpos |
                                                  std::ios_base::showbase | std::ios_base::showpoint |
                                                  std::ios_base::uppercase;
    const std::ios_base::fmtflags flags = os.flags() & k_shaping & ~std::ios_base::right;
    return flags == std::ios_base::dec && os.width() == 0 && os.getloc() == std::locale::classic();
}

}  // namespace qbxV2::detail
