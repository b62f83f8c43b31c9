#include "runtime/big_int.h"

#include <cstddef>
#include <ostream>
#include <string_view>

#include "runtime/text_cursor.h"
#include "runtime/wrapping_number.h"

namespace qbxV2 {

using detail::is_ascii_digit;
using detail::text_cursor;
using detail::wrapping_int;

namespace {

std::string_view or_zero(const char* s) { return s ? std::string_view(s) : std::string_view("0"); }
std::string_view or_empty(const char* s) { return s ? std::string_view(s) : std::string_view(); }

bool is_negative(std::string_view text) { return !text.empty() && text.front() == '-'; }

std::string_view without_zeros(std::string_view text) {
    const std::size_t first = text.find_first_not_of('0');
    return first == std::string_view::npos ? std::string_view() : text.substr(first);
}

std::string_view digits_of(const c_big_int& a) {
    const std::string_view text = a.text();
    return is_negative(text) ? text.substr(1) : text;
}

/// The text behind one sign and the zeros that follow it.
std::string_view significant(std::string_view s) {
    if (s.front() == '-' || s.front() == '+') s.remove_prefix(1);
    return without_zeros(s);
}

/// Whether `s` is a zero written "-0...": text behind that which is no digit would not be parsed.
bool is_negative_zero(std::string_view s) {
    if (s.size() < 2 || s[0] != '-' || s[1] != '0') return false;
    const std::string_view rest = without_zeros(s.substr(1));
    return rest.empty() || !is_ascii_digit(rest.front());
}

bool is_zero(const c_big_int& a) { return a.text() == "0"; }

bool is_equal(const c_big_int& a, std::string_view s) {
    // Intended: the empty text equals nothing, and nothing is above it.
    if (s.empty()) return false;
    if (is_negative(a.text()) != is_negative(s)) return is_zero(a) && is_negative_zero(s);
    const std::string_view rest = significant(s);
    return rest.empty() ? is_zero(a) : digits_of(a) == rest;
}

bool is_above(const c_big_int& a, std::string_view s) {
    if (s.empty()) return false;
    const bool negative = is_negative(a.text());
    if (negative != is_negative(s)) return !(is_zero(a) && is_negative_zero(s)) && !negative;
    const std::string_view rest = significant(s);
    if (rest.empty()) return !negative && !is_zero(a);
    const std::string_view digits = digits_of(a);
    if (digits.size() != rest.size()) return negative == (digits.size() < rest.size());
    return negative ? digits < rest : digits > rest;
}

bool is_below(const c_big_int& a, std::string_view s) { return !is_equal(a, s) && !is_above(a, s); }
bool is_above_or_equal(const c_big_int& a, std::string_view s) { return is_equal(a, s) || is_above(a, s); }

std::string parse(std::string_view text) {
    const bool negative = is_negative(text);
    if (!text.empty() && (negative || text.front() == '+')) text.remove_prefix(1);
    text = without_zeros(text);
    text_cursor cursor(text.data(), text.size());
    const std::size_t count = cursor.skip_digits();
    if (count == 0) return "0";
    std::string result;
    result.reserve(count + 1);
    if (negative) result.push_back('-');
    return result.append(text.substr(0, count));
}

}  // namespace

c_big_int::c_big_int() : m_text("0") {}
c_big_int::c_big_int(const std::string& text) : m_text(parse(text)) {}
c_big_int::c_big_int(long value) : m_text(std::to_string(value)) {}
c_big_int::c_big_int(const char* text) : m_text(parse(or_empty(text))) {}

c_big_int& c_big_int::operator=(const std::string& text) {
    m_text = parse(text);
    return *this;
}

c_big_int& c_big_int::operator=(long value) {
    m_text = std::to_string(value);
    return *this;
}

c_big_int& c_big_int::operator=(const char* text) {
    m_text = parse(or_empty(text));
    return *this;
}

long c_big_int::get(bool* overflow) const {
    wrapping_int result;
    for (const char c : digits_of(*this)) result.append_digit(c);
    if (is_negative(m_text)) result.negate();
    if (overflow) *overflow = result.overflow();
    return result.value();
}

double c_big_int::get_as_float() const {
    double value = 0.0;
    for (const char c : digits_of(*this)) value = value * 10.0 + (c - '0');
    return is_negative(m_text) ? -value : value;
}

std::ostream& operator<<(std::ostream& os, const c_big_int& value) { return os << value.text(); }

bool operator==(const c_big_int& a, const c_big_int& b) { return a.text() == b.text(); }
bool operator!=(const c_big_int& a, const c_big_int& b) { return a.text() != b.text(); }
bool operator<(const c_big_int& a, const c_big_int& b) { return a != b && !is_above(a, b.text()); }
bool operator<=(const c_big_int& a, const c_big_int& b) { return !is_above(a, b.text()); }
bool operator>(const c_big_int& a, const c_big_int& b) { return is_above(a, b.text()); }
bool operator>=(const c_big_int& a, const c_big_int& b) { return a == b || is_above(a, b.text()); }

bool operator==(const c_big_int& a, const std::string& s) { return is_equal(a, s); }
bool operator!=(const c_big_int& a, const std::string& s) { return !is_equal(a, s); }
bool operator<(const c_big_int& a, const std::string& s) { return is_below(a, s); }
bool operator<=(const c_big_int& a, const std::string& s) { return !is_above(a, s); }
bool operator>(const c_big_int& a, const std::string& s) { return is_above(a, s); }
bool operator>=(const c_big_int& a, const std::string& s) { return is_above_or_equal(a, s); }
bool operator==(const std::string& s, const c_big_int& a) { return is_equal(a, s); }
bool operator!=(const std::string& s, const c_big_int& a) { return !is_equal(a, s); }
bool operator<(const std::string& s, const c_big_int& a) { return is_above(a, s); }
bool operator<=(const std::string& s, const c_big_int& a) { return is_above_or_equal(a, s); }
bool operator>(const std::string& s, const c_big_int& a) { return is_below(a, s); }
bool operator>=(const std::string& s, const c_big_int& a) { return !is_above(a, s); }

bool operator==(const c_big_int& a, const char* s) { return is_equal(a, or_zero(s)); }
bool operator!=(const c_big_int& a, const char* s) { return !is_equal(a, or_zero(s)); }
bool operator<(const c_big_int& a, const char* s) { return is_below(a, or_zero(s)); }
bool operator<=(const c_big_int& a, const char* s) { return !is_above(a, or_zero(s)); }
bool operator>(const c_big_int& a, const char* s) { return is_above(a, or_zero(s)); }
bool operator>=(const c_big_int& a, const char* s) { return is_above_or_equal(a, or_zero(s)); }
bool operator==(const char* s, const c_big_int& a) { return is_equal(a, or_zero(s)); }
bool operator!=(const char* s, const c_big_int& a) { return !is_equal(a, or_zero(s)); }
bool operator<(const char* s, const c_big_int& a) { return is_above(a, or_zero(s)); }
bool operator<=(const char* s, const c_big_int& a) { return is_above_or_equal(a, or_zero(s)); }
bool operator>(const char* s, const c_big_int& a) { return is_below(a, or_zero(s)); }
bool operator>=(const char* s, const c_big_int& a) { return !is_above(a, or_zero(s)); }

}  // namespace qbxV2
