#pragma once

#include <cstddef>
#include <cstdint>

namespace qbxV2::detail {

/// A byte with the top bit set is no digit.
constexpr bool is_ascii_digit(char c) { return c >= '0' && c <= '9'; }

/// A place in a text that is being checked or parsed from left to right. It owns nothing.
class text_cursor {
public:
    text_cursor(const char* text, std::size_t size) : m_at(text), m_end(text + size) {}

    bool at_end() const { return m_at == m_end; }
    const char* position() const { return m_at; }
    std::size_t rest() const { return static_cast<std::size_t>(m_end - m_at); }

    /// Steps over `c` if it stands here.
    bool accept(char c) {
        if (m_at == m_end || *m_at != c) return false;
        ++m_at;
        return true;
    }

    /// Steps over a "+" or a "-" if one stands here; tells whether it was a "-".
    bool accept_sign() {
        if (accept('-')) return true;
        accept('+');
        return false;
    }

    /// Steps over all digits that stand here and counts them.
    std::size_t skip_digits() {
        const char* const start = m_at;
        while (m_at != m_end && is_ascii_digit(*m_at)) ++m_at;
        return static_cast<std::size_t>(m_at - start);
    }

    /// Steps over all digits that stand here, adds them up modulo 2^32 into `value`, and counts them.
    std::size_t read_digits(std::uint32_t& value) {
        const char* const start = m_at;
        value = 0;
        for (; m_at != m_end && is_ascii_digit(*m_at); ++m_at) {
            value = value * 10U + static_cast<std::uint32_t>(*m_at - '0');
        }
        return static_cast<std::size_t>(m_at - start);
    }

    /// Steps over exactly `count` digits, or stays.
    bool accept_digits(std::size_t count) {
        if (rest() < count) return false;
        for (std::size_t i = 0; i < count; ++i) {
            if (!is_ascii_digit(m_at[i])) return false;
        }
        m_at += count;
        return true;
    }

    /// Steps over digits with at most one point among them; false when there is no digit.
    bool accept_mantissa() {
        std::size_t digits = skip_digits();
        if (accept('.')) digits += skip_digits();
        return digits != 0;
    }

private:
    const char* m_at;
    const char* m_end;
};

}  // namespace qbxV2::detail
