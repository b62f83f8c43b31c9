#include "runtime/decimal.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <ostream>
#include <string_view>
#include <utility>

#include "runtime/text_cursor.h"
#include "runtime/wrapping_number.h"

namespace qbxV2 {

using detail::text_cursor;
using detail::wrapping_int;
using detail::wrapping_unsigned;

namespace {

/// Room for the digits of a whole part that is built from a number and zeros, with a terminator.
constexpr std::size_t k_scaled_text_size = 30;
/// "-", the 309 digits of the largest double, ".", 15 digits, terminator; and a byte to spare.
constexpr std::size_t k_double_text_size = 328;

/// The magnitude as such: negating the lowest `long` would not fit.
unsigned long magnitude_of(long value) {
    return value < 0 ? 0UL - static_cast<unsigned long>(value) : static_cast<unsigned long>(value);
}

/// Compares fractions digit by digit. Intended: where one ends and the other goes on with more than zeros,
/// the longer one is the lower one.
int compare_fractions(std::string_view a, std::string_view b) {
    const std::size_t common = std::min(a.size(), b.size());
    if (const int order = a.substr(0, common).compare(b.substr(0, common))) return order;
    const bool a_goes_on = a.find_first_not_of('0', common) != std::string_view::npos;
    const bool b_goes_on = b.find_first_not_of('0', common) != std::string_view::npos;
    return static_cast<int>(b_goes_on) - static_cast<int>(a_goes_on);
}

std::string_view digits_of(const std::string& integral) {
    const std::string_view text = integral;
    return text.front() == '-' ? text.substr(1) : text;
}

}  // namespace

c_decimal::c_decimal(const std::string& text) { parse(text.data(), text.size()); }
c_decimal::c_decimal(const char* text) { parse(text, text ? std::string_view(text).size() : 0); }
c_decimal::c_decimal(double value, unsigned int precision) { set(value, precision); }

c_decimal::c_decimal(long value, int scale) : m_negative(value < 0) {
    unsigned long magnitude = magnitude_of(value);
    if (scale <= 0) {
        std::string digits = std::to_string(magnitude);
        const std::uint64_t zeros = 0U - static_cast<std::uint64_t>(scale);
        if (digits.size() + zeros + 1 > k_scaled_text_size) std::abort();
        digits.append(static_cast<std::size_t>(zeros), '0');
        m_integral = digits;
        return;
    }
    std::uint32_t fraction = 0;
    std::uint32_t power = 1;
    for (int i = 0; i < scale && magnitude != 0; ++i) {
        fraction += power * static_cast<std::uint32_t>(magnitude % 10);
        power *= 10U;
        magnitude /= 10;
    }
    m_integral = std::to_string(magnitude);
    set_fractional(fraction, static_cast<unsigned int>(scale));
}

c_decimal& c_decimal::operator=(const std::string& text) {
    c_decimal(text).swap(*this);
    return *this;
}

c_decimal& c_decimal::operator=(const char* text) {
    c_decimal(text).swap(*this);
    return *this;
}

c_decimal& c_decimal::operator=(double value) {
    set(value);
    return *this;
}

void c_decimal::parse(const char* text, std::size_t size) {
    text_cursor cursor(text, size);
    m_negative = cursor.accept_sign();
    // A second sign belongs to the whole part, which takes one too; the point is looked for where this one
    // stands.
    m_integral = std::string(cursor.position(), cursor.rest());
    cursor.skip_digits();
    m_fractional.clear();
    if (!cursor.accept('.')) return;
    const char* const digits = cursor.position();
    m_fractional.assign(digits, cursor.skip_digits());
}

void c_decimal::set(double value, unsigned int precision) {
    std::array<char, k_double_text_size> text{};
    const int digits = static_cast<int>(std::min(precision, k_max_precision));
    const int size = std::snprintf(text.data(), text.size(), "%.*f", digits, value);
    parse(text.data(), static_cast<std::size_t>(size));
}

long c_decimal::get_integral(bool* overflow) const {
    const long value = m_integral.get(overflow);
    return m_negative ? static_cast<std::int32_t>(0U - static_cast<std::uint32_t>(value)) : value;
}

void c_decimal::set_integral(long value) {
    m_negative = value < 0;
    m_integral = std::to_string(magnitude_of(value));
}

unsigned long c_decimal::get_fractional(int digits, bool* overflow) const {
    wrapping_unsigned result;
    const std::size_t wanted = digits > 0 ? static_cast<std::size_t>(digits) : 0;
    const std::size_t present = std::min(wanted, m_fractional.size());
    for (std::size_t i = 0; i < present; ++i) result.append_digit(m_fractional[i]);
    result.append_zeros(wanted - present);
    if (overflow) *overflow = result.overflow();
    return result.value();
}

void c_decimal::set_fractional(unsigned long value, unsigned int digits) {
    const std::string text = std::to_string(value);
    m_fractional.clear();
    if (digits > text.size()) m_fractional.assign(digits - text.size(), '0');
    m_fractional.append(text, 0, digits);
}

long c_decimal::get_scaled(int scale, bool* overflow) const {
    wrapping_int result;
    const std::string_view whole = digits_of(m_integral.text());
    const auto wanted = static_cast<std::int64_t>(whole.size()) + scale;
    for (std::size_t i = 0; i < whole.size() && static_cast<std::int64_t>(i) < wanted; ++i) {
        result.append_digit(whole[i]);
    }
    if (scale > 0) {
        const auto places = static_cast<std::size_t>(scale);
        const std::size_t present = std::min(places, m_fractional.size());
        for (std::size_t i = 0; i < present; ++i) result.append_digit(m_fractional[i]);
        result.append_zeros(places - present);
    }
    if (m_negative || m_integral.text().front() == '-') result.negate();
    if (overflow) *overflow = result.overflow();
    return result.value();
}

void c_decimal::set_scaled(long value, int scale) { c_decimal(value, scale).swap(*this); }

double c_decimal::get_as_float() const {
    double value = m_integral.get_as_float();
    // Summed from the point on, with a factor that is itself rounded: the last bits of the result follow from
    // it.
    double factor = 0.1;
    for (const char c : m_fractional) {
        value += (c - '0') * factor;
        factor /= 10.0;
    }
    return m_negative ? -value : value;
}

std::string c_decimal::get_as_string() const {
    std::string text;
    if (m_negative) text.push_back('-');
    if (m_fractional.empty() || m_integral.text() != "0") text.append(m_integral.text());
    if (!m_fractional.empty()) text.append(1, '.').append(m_fractional);
    return text;
}

bool c_decimal::is_valid(const std::string& text) { return is_valid(text.data(), text.size()); }
bool c_decimal::is_valid(const char* text, std::size_t size) {
    text_cursor cursor(text, size);
    cursor.accept_sign();
    return cursor.accept_mantissa() && cursor.at_end();
}

void c_decimal::swap(c_decimal& other) noexcept {
    std::swap(m_negative, other.m_negative);
    m_integral.swap(other.m_integral);
    m_fractional.swap(other.m_fractional);
}

std::ostream& operator<<(std::ostream& os, const c_decimal& value) { return os << value.get_as_string(); }

bool operator==(const c_decimal& a, const c_decimal& b) {
    return a.m_negative == b.m_negative && a.m_integral == b.m_integral &&
           compare_fractions(a.m_fractional, b.m_fractional) == 0;
}

bool operator>(const c_decimal& a, const c_decimal& b) {
    if (a.m_negative != b.m_negative) return !a.m_negative;
    if (a.m_integral != b.m_integral)
        return a.m_negative ? a.m_integral < b.m_integral : a.m_integral > b.m_integral;
    const int order = compare_fractions(a.m_fractional, b.m_fractional);
    return a.m_negative ? order < 0 : order > 0;
}

bool operator!=(const c_decimal& a, const c_decimal& b) { return !(a == b); }
bool operator<(const c_decimal& a, const c_decimal& b) { return !(a == b) && !(a > b); }
bool operator<=(const c_decimal& a, const c_decimal& b) { return !(a > b); }
bool operator>=(const c_decimal& a, const c_decimal& b) { return a == b || a > b; }

}  // namespace qbxV2
