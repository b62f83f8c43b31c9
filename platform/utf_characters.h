#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <type_traits>

/// UTF-8 and UTF-16, a character at a time.
namespace vrl_platform {

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

/// The two surrogates of a character above 16 bits.
constexpr std::uint32_t high_surrogate_of(std::uint32_t code) { return 0xD800 + ((code - 0x10000) >> 10); }
constexpr std::uint32_t low_surrogate_of(std::uint32_t code) { return 0xDC00 + (code & 0x3FF); }

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

/// Bytes of the sequence that begins with `lead`, 0 if none does, and the payload bits of `lead`.
inline std::size_t utf8_sequence_length(std::uint32_t lead, std::uint32_t& payload) {
    payload = lead;
    if (lead < 0x80) return 1;
    payload = lead & 0x1F;
    if ((lead & 0xE0) == 0xC0) return 2;
    payload = lead & 0x0F;
    if ((lead & 0xF0) == 0xE0) return 3;
    payload = lead & 0x07;
    if ((lead & 0xF8) == 0xF0) return 4;
    return 0;
}

/// Reads the sequence at `at` into `code` and returns its length; 0 when there is none or it is broken.
inline std::size_t read_utf8_sequence(const char* in, std::size_t size, std::size_t at, std::uint32_t& code) {
    const std::size_t count = utf8_sequence_length(static_cast<unsigned char>(in[at]), code);
    if (count == 0 || count > size - at) return 0;
    for (std::size_t i = 1; i < count; ++i) {
        const auto byte = static_cast<unsigned char>(in[at + i]);
        if ((byte & 0xC0) != 0x80) return 0;
        code = (code << 6) | (byte & 0x3FU);
    }
    return count;
}

}  // namespace vrl_platform
