#pragma once

#include <cstddef>
#include <iosfwd>
#include <string>
#include <type_traits>

#include "platform/api.h"
#include "runtime/big_int.h"

namespace qbxV2 {

/// An XML Schema decimal of any length, kept as text: a sign, a whole part, and the digits of the fraction as
/// given, trailing zeros included. It does no arithmetic.
///
/// Parsing never fails: a text gives what could be read of it. A null pointer counts as the empty text. Where
/// an operation answers through an `overflow` pointer, that may be null; otherwise it is stored in every
/// case.
class VRL_API c_decimal {
    template <typename T>
    using if_integer = std::enable_if_t<std::is_integral_v<T>, int>;

public:
    /// Digits behind the point that a conversion from double gives at most.
    static constexpr unsigned int k_max_precision = 15;

    c_decimal() = default;
    c_decimal(const c_decimal& other) = default;
    c_decimal(const std::string& text);
    c_decimal(const char* text);
    /// `value` times ten to the power of minus `scale`; the fraction has `scale` digits. A negative scale
    /// appends zeros; when digits, zeros and terminator pass 30 bytes the process ends.
    c_decimal(long value, int scale = 0);
    template <typename Integer, if_integer<Integer> = 0>
    c_decimal(Integer value) : c_decimal(static_cast<long>(value)) {}
    template <typename Integer, typename Scale, if_integer<Integer> = 0, if_integer<Scale> = 0>
    c_decimal(Integer value, Scale scale) : c_decimal(static_cast<long>(value), static_cast<int>(scale)) {}
    /// `value` with `precision` digits behind the point, at most 15. Printed in the process's locale: where
    /// that has a decimal comma the fraction is lost. Infinity and NaN give 0.
    c_decimal(double value, unsigned int precision = k_max_precision);
    /// The same; a negative precision counts as one above 15.
    template <typename Precision, if_integer<Precision> = 0>
    c_decimal(double value, Precision precision) : c_decimal(value, static_cast<unsigned int>(precision)) {}
    /// An `unsigned int` is a precision behind a whole number, too.
    template <typename Integer, if_integer<Integer> = 0>
    c_decimal(Integer value, unsigned int precision) : c_decimal(static_cast<double>(value), precision) {}
    ~c_decimal() = default;

    c_decimal& operator=(const c_decimal& other) = default;
    c_decimal& operator=(const std::string& text);
    c_decimal& operator=(const char* text);
    /// With 15 digits behind the point.
    c_decimal& operator=(double value);
    template <typename Integer, if_integer<Integer> = 0>
    c_decimal& operator=(Integer value) {
        return *this = static_cast<double>(value);
    }

    void set(double value, unsigned int precision = k_max_precision);

    /// The whole part with the sign, as `c_big_int::get`.
    long get_integral(bool* overflow) const;
    /// Replaces sign and whole part; the fraction stays.
    void set_integral(long value);

    /// The first `digits` digits of the fraction as a number, as if zeros followed it; 0 for `digits` of 0 or
    /// less. 32-bit arithmetic, wrapped on overflow.
    unsigned long get_fractional(int digits, bool* overflow) const;
    /// Replaces the fraction by `value` with zeros in front up to `digits` digits, or by its first `digits`
    /// digits.
    void set_fractional(unsigned long value, unsigned int digits);

    /// The value times ten to the power `scale`, the rest cut off. 32-bit arithmetic, wrapped on overflow. A
    /// negative scale that leaves no digit gives 0.
    long get_scaled(int scale, bool* overflow) const;
    void set_scaled(long value, int scale = 0);

    double get_as_float() const;
    /// As the stream operator: "-" if negative, the whole part unless it is zero and a fraction exists, "."
    /// and the fraction. So one half is ".5".
    std::string get_as_string() const;

    /// An optional sign, digits with at most one point and at least one digit. No exponent, no "INF", no
    /// "NaN".
    [[nodiscard]] static bool is_valid(const std::string& text);
    [[nodiscard]] static bool is_valid(const char* text, std::size_t size);

    void swap(c_decimal& other) noexcept;

private:
    friend VRL_API bool operator==(const c_decimal& a, const c_decimal& b);
    friend VRL_API bool operator>(const c_decimal& a, const c_decimal& b);

    void parse(const char* text, std::size_t size);

    bool m_negative = false;
    c_big_int m_integral;
    std::string m_fractional;
};

inline void swap(c_decimal& a, c_decimal& b) noexcept { a.swap(b); }

VRL_API std::ostream& operator<<(std::ostream& os, const c_decimal& value);

/// Trailing zeros of the fraction do not matter; minus zero and zero differ. Intended: of two fractions of
/// which one continues the other, the longer is the lower one, so 0.25 < 0.2.
VRL_API bool operator==(const c_decimal& a, const c_decimal& b);
VRL_API bool operator!=(const c_decimal& a, const c_decimal& b);
VRL_API bool operator<(const c_decimal& a, const c_decimal& b);
VRL_API bool operator<=(const c_decimal& a, const c_decimal& b);
VRL_API bool operator>(const c_decimal& a, const c_decimal& b);
VRL_API bool operator>=(const c_decimal& a, const c_decimal& b);

}  // namespace qbxV2
