#pragma once

#include <array>

namespace qbxV2::detail {

/// What a character can be in XML text, as bits. The table equals the C library's `isspace`, `isalpha`,
/// `isalnum`, `isdigit` and `isxdigit` in the "C" locale, whatever locale the process has set.
enum char_class : unsigned char {
    cc_space = 1,       ///< TAB, LF, VT, FF, CR, space
    cc_name_start = 2,  ///< letter, "_", ":", every byte from 0x80
    cc_name = 4,        ///< letter, digit, ".", "-", "_", ":", every byte from 0x80
    cc_digit = 8,       ///< 0 to 9
    cc_hex = 16,        ///< 0 to 9, a to f, A to F
    cc_text = 32,       ///< may stand inside a run of text: printable ASCII and TAB, but neither "<" nor "&"
    cc_value = 64,  ///< may stand inside a run of an attribute value: printable ASCII and TAB, but no quote
    cc_plain_name = 128  ///< a name character of ASCII
};

constexpr unsigned char class_of(unsigned char c) {
    const bool lower = c >= 'a' && c <= 'z';
    const bool upper = c >= 'A' && c <= 'Z';
    const bool digit = c >= '0' && c <= '9';
    const bool high = c >= 0x80;
    const bool printable = (c >= 0x20 && c < 0x7F) || c == '\t';
    unsigned bits = 0;
    if (c == ' ' || (c >= 9 && c <= 13)) bits |= cc_space;
    if (lower || upper || c == '_' || c == ':' || high) bits |= cc_name_start | cc_name;
    if (digit || c == '.' || c == '-') bits |= cc_name;
    if (digit) bits |= cc_digit | cc_hex;
    if ((c >= 'a' && c <= 'f') || (c >= 'A' && c <= 'F')) bits |= cc_hex;
    if (printable && c != '<' && c != '&') bits |= cc_text;
    if (printable && c != '"' && c != '\'') bits |= cc_value;
    if ((bits & cc_name) != 0 && !high) bits |= cc_plain_name;
    return static_cast<unsigned char>(bits);
}

constexpr std::array<unsigned char, 256> make_char_classes() {
    std::array<unsigned char, 256> table{};
    for (unsigned i = 0; i < 256; ++i) table[i] = class_of(static_cast<unsigned char>(i));
    return table;
}

inline constexpr std::array<unsigned char, 256> k_char_classes = make_char_classes();

inline bool byte_is(unsigned char c, unsigned mask) { return (k_char_classes[c] & mask) != 0; }

/// The tests on values of the reading stack: a byte 0 to 255, -1 for the end, or a negative value from entity
/// text.
inline bool value_is(int c, unsigned mask) { return c >= 0 && byte_is(static_cast<unsigned char>(c), mask); }
inline bool is_space(int c) { return value_is(c, cc_space); }
inline bool is_name_start(int c) { return value_is(c, cc_name_start); }
inline bool is_name_char(int c) { return value_is(c, cc_name); }

}  // namespace qbxV2::detail
