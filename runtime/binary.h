#pragma once

#include <cstddef>
#include <iosfwd>
#include <string>
#include <vector>

#include "platform/api.h"

namespace qbxV2 {

/// The value of XML Schema's `base64Binary` and `hexBinary`: owned bytes, possibly none.
class VRL_API c_binary {
public:
    c_binary() = default;
    c_binary(const unsigned char* data, unsigned int size) { set(data, size); }

    /// Replaces the content by a copy of `size` bytes at `data`, which may lie in this object. With size 0
    /// `data` may be null. Throws std::length_error for a size above 0x7FFFFFFF.
    void set(const unsigned char* data, unsigned int size);
    /// Copies the first `max` bytes, or all if fewer, to `dest` and returns `dest`.
    unsigned char* get(unsigned char* dest, unsigned int max) const;

    unsigned int size() const { return static_cast<unsigned int>(m_bytes.size()); }
    /// The bytes, valid until the value changes; may be null when the value is empty.
    const unsigned char* data() const { return m_bytes.data(); }

    /// No bound check.
    unsigned char& operator[](unsigned int index) { return m_bytes[index]; }
    const unsigned char& operator[](unsigned int index) const { return m_bytes[index]; }
    /// Throws std::out_of_range with the text "invalid vector<T> subscript".
    unsigned char& at(unsigned int index);
    const unsigned char& at(unsigned int index) const;

    /// Appends one byte.
    void operator+=(unsigned char byte) { m_bytes.push_back(byte); }

    bool equal(const unsigned char* data, unsigned int size) const;
    void swap(c_binary& other) noexcept { m_bytes.swap(other.m_bytes); }

    /// Replaces the content by what `text` holds in base64. Every character outside the alphabet, "="
    /// included, is skipped; of 2 or 3 characters left over at the end 1 or 2 bytes are made, of a single one
    /// 1 byte.
    void from_base64(const std::string& text);
    void from_base64(const char* text, std::size_t size);
    /// Replaces the content by one byte for each pair of hexadecimal digits; a last single digit is ignored.
    /// A character that is no digit gives a meaningless byte: check first.
    void from_hex(const std::string& text);
    void from_hex(const char* text, std::size_t size);

    /// RFC 4648, section 4, on one line whatever the length.
    void out_base64(std::ostream& os) const;
    /// Two upper-case digits a byte. The stream's flags are afterwards as before, its fill character is "0".
    void out_hex(std::ostream& os) const;
    /// Appends what `out_base64` writes.
    void append_base64(std::string& out) const;

    /// Groups of four characters, white space between them, "=" and "==" at the end; the empty text; white
    /// space alone, from two characters on.
    [[nodiscard]] static bool is_valid_base64(const std::string& text);
    [[nodiscard]] static bool is_valid_base64(const char* text, std::size_t size);
    /// An even number of hexadecimal digits, or the empty text.
    [[nodiscard]] static bool is_valid_hex(const std::string& text);
    [[nodiscard]] static bool is_valid_hex(const char* text, std::size_t size);

private:
    std::vector<unsigned char> m_bytes;
};

using tc_binary = c_binary;

inline void swap(c_binary& a, c_binary& b) noexcept { a.swap(b); }

VRL_API bool operator==(const c_binary& a, const c_binary& b);
VRL_API bool operator!=(const c_binary& a, const c_binary& b);

}  // namespace qbxV2
