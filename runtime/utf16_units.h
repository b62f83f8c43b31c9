#pragma once

#include <cstdint>
#include <string>
#include <type_traits>

namespace qbxV2::detail {

/// The value of an element, whether `wchar_t` is signed or not.
constexpr std::uint32_t code_of(wchar_t element) {
    return static_cast<std::make_unsigned_t<wchar_t>>(element);
}

constexpr bool is_high_surrogate(std::uint32_t unit) { return unit >= 0xD800 && unit <= 0xDBFF; }
constexpr bool is_low_surrogate(std::uint32_t unit) { return unit >= 0xDC00 && unit <= 0xDFFF; }

/// The character of a high surrogate and a low one (RFC 2781, section 2.2).
constexpr std::uint32_t from_surrogates(std::uint32_t high, std::uint32_t low) {
    return 0x10000 + ((high - 0xD800) << 10) + (low - 0xDC00);
}

/// Appends `code` as UTF-8 (RFC 3629, section 3). A surrogate is encoded like any other value; above 21 bits
/// the rest is cut off.
inline void append_utf8(std::string& out, std::uint32_t code) {
    const auto put = [&out](std::uint32_t byte) { out.push_back(static_cast<char>(byte)); };
    if (code < 0x80) {
        put(code);
    } else if (code < 0x800) {
        put(0xC0 | (code >> 6));
        put(0x80 | (code & 0x3F));
    } else if (code < 0x10000) {
        put(0xE0 | (code >> 12));
        put(0x80 | ((code >> 6) & 0x3F));
        put(0x80 | (code & 0x3F));
    } else {
        put(0xF0 | ((code >> 18) & 0x07));
        put(0x80 | ((code >> 12) & 0x3F));
        put(0x80 | ((code >> 6) & 0x3F));
        put(0x80 | (code & 0x3F));
    }
}

}  // namespace qbxV2::detail
