#include "runtime/binary.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <cstring>
#include <iomanip>
#include <ostream>
#include <stdexcept>

#include "runtime/character_class.h"
#include "runtime/stream_state.h"

namespace qbxV2 {
namespace {

/// RFC 4648, table 1.
constexpr char k_base64[] = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
constexpr char k_hex[] = "0123456789ABCDEF";
constexpr unsigned char k_no_value = 0xFF;

constexpr std::array<unsigned char, 256> make_base64_values() {
    std::array<unsigned char, 256> table{};
    for (unsigned char& value : table) value = k_no_value;
    for (unsigned char i = 0; i < 64; ++i) table[static_cast<unsigned char>(k_base64[i])] = i;
    return table;
}

/// The six bits of each character of the alphabet.
constexpr std::array<unsigned char, 256> k_base64_values = make_base64_values();

unsigned char base64_value(char c) { return k_base64_values[static_cast<unsigned char>(c)]; }
bool is_space(char c) { return detail::byte_is(static_cast<unsigned char>(c), detail::cc_space); }
bool is_hex_digit(char c) { return detail::byte_is(static_cast<unsigned char>(c), detail::cc_hex); }

/// Bytes that are encoded at a time: whole groups, so that only the last piece is padded.
constexpr std::size_t k_piece = 3 * 1024;

/// Writes `size` bytes as base64 to `out` and returns the end. The text has no line breaks, however long.
char* put_base64(char* out, const unsigned char* data, std::size_t size) {
    const auto put = [&out](std::uint32_t bits) { *out++ = k_base64[bits & 0x3F]; };
    for (; size >= 3; data += 3, size -= 3) {
        const std::uint32_t group = (std::uint32_t{data[0]} << 16) | (std::uint32_t{data[1]} << 8) | data[2];
        put(group >> 18);
        put(group >> 12);
        put(group >> 6);
        put(group);
    }
    if (size == 0) return out;
    const std::uint32_t group =
        (std::uint32_t{data[0]} << 16) | (size > 1 ? std::uint32_t{data[1]} << 8 : 0U);
    put(group >> 18);
    put(group >> 12);
    if (size > 1) {
        put(group >> 6);
    } else {
        *out++ = '=';
    }
    *out++ = '=';
    return out;
}

/// Calls `write(text, size)` with the base64 text of all bytes, piece by piece.
template <typename Write>
void encode_base64(const std::vector<unsigned char>& bytes, Write write) {
    std::array<char, k_piece / 3 * 4> text;
    for (std::size_t at = 0; at < bytes.size(); at += k_piece) {
        const std::size_t count = std::min(k_piece, bytes.size() - at);
        write(text.data(),
              static_cast<std::size_t>(put_base64(text.data(), &bytes[at], count) - text.data()));
    }
}

/// Four bits of a hexadecimal digit; other characters give what the arithmetic gives.
unsigned int nibble(char c) {
    if (c >= '0' && c <= '9') return static_cast<unsigned int>(c - '0');
    return (static_cast<unsigned int>(static_cast<unsigned char>(c)) | 0x20U) - 'a' + 10U;
}

}  // namespace

void c_binary::set(const unsigned char* data, unsigned int size) {
    if (size > 0x7FFFFFFFU) throw std::length_error("vector<T> too long");
    std::vector<unsigned char> copy;
    if (size != 0) copy.assign(data, data + size);
    m_bytes.swap(copy);
}

unsigned char* c_binary::get(unsigned char* dest, unsigned int max) const {
    const std::size_t count = std::min<std::size_t>(max, m_bytes.size());
    if (count != 0) std::memcpy(dest, m_bytes.data(), count);
    return dest;
}

unsigned char& c_binary::at(unsigned int index) {
    if (index >= m_bytes.size()) throw std::out_of_range("invalid vector<T> subscript");
    return m_bytes[index];
}

const unsigned char& c_binary::at(unsigned int index) const {
    if (index >= m_bytes.size()) throw std::out_of_range("invalid vector<T> subscript");
    return m_bytes[index];
}

bool c_binary::equal(const unsigned char* data, unsigned int size) const {
    return m_bytes.size() == size && (size == 0 || std::memcmp(m_bytes.data(), data, size) == 0);
}

void c_binary::from_base64(const std::string& text) { from_base64(text.data(), text.size()); }
void c_binary::from_base64(const char* text, std::size_t size) {
    m_bytes.clear();
    m_bytes.reserve(size / 4 * 3 + 3);
    std::uint32_t group = 0;
    unsigned int count = 0;
    for (const char* const end = text + size; text != end; ++text) {
        const unsigned char value = base64_value(*text);
        if (value == k_no_value) continue;
        group = (group << 6) | value;
        if (++count < 4) continue;
        m_bytes.push_back(static_cast<unsigned char>(group >> 16));
        m_bytes.push_back(static_cast<unsigned char>(group >> 8));
        m_bytes.push_back(static_cast<unsigned char>(group));
        group = 0;
        count = 0;
    }
    if (count == 0) return;
    group <<= 6 * (4 - count);
    m_bytes.push_back(static_cast<unsigned char>(group >> 16));
    if (count == 3) m_bytes.push_back(static_cast<unsigned char>(group >> 8));
}

void c_binary::from_hex(const std::string& text) { from_hex(text.data(), text.size()); }
void c_binary::from_hex(const char* text, std::size_t size) {
    m_bytes.clear();
    m_bytes.reserve(size / 2);
    for (std::size_t i = 0; i + 1 < size; i += 2) {
        m_bytes.push_back(static_cast<unsigned char>((nibble(text[i]) << 4) | nibble(text[i + 1])));
    }
}

void c_binary::out_base64(std::ostream& os) const {
    encode_base64(m_bytes, [&os](const char* text, std::size_t size) {
        os.write(text, static_cast<std::streamsize>(size));
    });
}

void c_binary::append_base64(std::string& out) const {
    out.reserve(out.size() + (m_bytes.size() + 2) / 3 * 4);
    encode_base64(m_bytes, [&out](const char* text, std::size_t size) { out.append(text, size); });
}

void c_binary::out_hex(std::ostream& os) const {
    os.fill('0');
    if (!detail::prints_plainly(os)) {
        const std::ios_base::fmtflags flags = os.flags();
        os << std::hex << std::uppercase;
        for (const unsigned int byte : m_bytes) os << std::setw(2) << byte;
        os.flags(flags);
        return;
    }
    std::array<char, k_piece> text;
    for (std::size_t at = 0; at < m_bytes.size();) {
        const std::size_t until = std::min(m_bytes.size(), at + text.size() / 2);
        char* out = text.data();
        for (; at != until; ++at) {
            *out++ = k_hex[m_bytes[at] >> 4];
            *out++ = k_hex[m_bytes[at] & 0x0F];
        }
        os.write(text.data(), out - text.data());
    }
}

bool c_binary::is_valid_base64(const std::string& text) { return is_valid_base64(text.data(), text.size()); }
bool c_binary::is_valid_base64(const char* text, std::size_t size) {
    if (size == 0) return true;
    std::size_t at = 0;
    std::size_t digits = 0;
    for (; at < size; ++at) {
        if (base64_value(text[at]) != k_no_value) {
            ++digits;
        } else if (!is_space(text[at])) {
            break;
        }
    }
    // Intended: what stands behind the data is counted as padding, white space too.
    const std::size_t padding = size - at;
    if (at < 2 || padding > 2 || (padding + digits) % 4 != 0) return false;
    for (; at < size; ++at) {
        if (is_space(text[at])) return true;
        if (text[at] != '=') return false;
    }
    return true;
}

bool c_binary::is_valid_hex(const std::string& text) { return is_valid_hex(text.data(), text.size()); }
bool c_binary::is_valid_hex(const char* text, std::size_t size) {
    return size % 2 == 0 && std::all_of(text, text + size, is_hex_digit);
}

bool operator==(const c_binary& a, const c_binary& b) { return a.equal(b.data(), b.size()); }
bool operator!=(const c_binary& a, const c_binary& b) { return !(a == b); }

}  // namespace qbxV2
