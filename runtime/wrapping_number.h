#pragma once

#include <cstdint>

namespace qbxV2::detail {

/// Sums up decimal digits in signed 32-bit arithmetic, whatever the width of `long`: the value wraps and goes
/// on, and the overflow stays noted.
class wrapping_int {
public:
    /// `digit` is an ASCII digit.
    void append_digit(char digit) {
        const auto d = static_cast<std::uint32_t>(digit - '0');
        const std::uint32_t tenfold = m_bits * 10U;
        // Intended: 2147483648 overflows behind a "-" too.
        if (value() > 214748364 || as_signed(2147483647U - tenfold) < static_cast<std::int32_t>(d))
            m_overflow = true;
        m_bits = tenfold + d;
    }

    /// Appends `count` zeros. 32 of them already shift every bit out.
    void append_zeros(std::uint64_t count) {
        for (; count != 0 && m_bits != 0; --count) append_digit('0');
    }

    void negate() { m_bits = 0U - m_bits; }
    std::int32_t value() const { return as_signed(m_bits); }
    bool overflow() const { return m_overflow; }

private:
    static std::int32_t as_signed(std::uint32_t bits) { return static_cast<std::int32_t>(bits); }

    std::uint32_t m_bits = 0;
    bool m_overflow = false;
};

/// The same in unsigned arithmetic.
class wrapping_unsigned {
public:
    void append_digit(char digit) {
        const auto d = static_cast<std::uint32_t>(digit - '0');
        const std::uint32_t tenfold = m_bits * 10U;
        if (m_bits >= 429496730U || tenfold + d < tenfold) m_overflow = true;
        m_bits = tenfold + d;
    }

    void append_zeros(std::uint64_t count) {
        for (; count != 0 && m_bits != 0; --count) append_digit('0');
    }

    std::uint32_t value() const { return m_bits; }
    bool overflow() const { return m_overflow; }

private:
    std::uint32_t m_bits = 0;
    bool m_overflow = false;
};

}  // namespace qbxV2::detail
