#include "runtime/number_text.h"

#include <array>
#include <charconv>
#include <clocale>
#include <cmath>
#include <cstdint>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <string_view>

#include "runtime/character_class.h"
#include "runtime/text_cursor.h"

namespace qbxV2 {
using detail::is_ascii_digit;
using detail::text_cursor;

namespace {

/// The defined way: `atof`, whose point is the process's decimal mark. Where that is a comma, the first point
/// of the text becomes one.
double by_atof(const char* text, std::size_t size) {
    std::string copy(text, size);
    const std::size_t point = copy.find('.');
    if (point != std::string::npos && std::localeconv()->decimal_point[0] == ',') copy[point] = ',';
    // NOLINTNEXTLINE(bugprone-unchecked-string-to-number-conversion, cert-err34-c): any text has a value
    return std::atof(copy.c_str());
}

void skip_spaces(text_cursor& cursor) {
    while (!cursor.at_end() &&
           detail::byte_is(static_cast<unsigned char>(*cursor.position()), detail::cc_space)) {
        cursor.accept(*cursor.position());
    }
}

/// The digits at `cursor` as a number, held at `limit`.
std::uint64_t read_magnitude(text_cursor& cursor, std::uint64_t limit) {
    std::uint64_t value = 0;
    const char* at = cursor.position();
    for (const char* const end = at + cursor.skip_digits(); at != end; ++at) {
        value = value * 10U + static_cast<std::uint64_t>(*at - '0');
        if (value > limit) value = limit;
    }
    return value;
}

std::size_t put(char* out, std::string_view text) {
    std::memcpy(out, text.data(), text.size());
    return text.size();
}

/// Writes the texts of the values that have one of their own; 0 for any other value.
std::size_t format_special(char* out, double value) {
    if (std::isnan(value)) return put(out, "NaN");
    if (std::isinf(value)) return put(out, value < 0 ? "-INF" : "INF");
    if (value == 0.0) return put(out, std::signbit(value) ? "-0.0" : "0.0");
    return 0;
}

constexpr int k_double_digits = 14;
constexpr int k_float_digits = 7;

/// Decimal digits without trailing zeros; the point stands behind the first one, then times ten to
/// `exponent`.
struct decimal_digits {
    std::array<char, 24> digit{};
    int count = 0;
    int exponent = 0;
};

/// Writes `value`, which is positive, if it is a whole number of millionths that `double` tells from its
/// neighbours.
///
/// For `n` below 10^14, if n / 10^6 gives back `value`, then n / 10^6 lies within half a unit in the last
/// place of `value`: 14 significant digits are coarser than that by a factor of 40 and more, so rounding
/// `value` to them gives `n`. Returns 0 if it is no such number.
std::size_t format_millionths(char* out, double value) {
    constexpr double k_scale = 1e6;
    constexpr double k_limit = 1e8;
    constexpr double k_least = 1e-4;  // below, "%g" changes to an exponent
    if (!(value < k_limit && value >= k_least)) return 0;
    const auto millionths = static_cast<std::uint64_t>(value * k_scale + 0.5);
    if (static_cast<double>(millionths) / k_scale != value) return 0;
    char* const end = std::to_chars(out, out + k_number_text_size, millionths / 1000000U).ptr;
    auto fraction = static_cast<std::uint32_t>(millionths % 1000000U);
    if (fraction == 0) return static_cast<std::size_t>(end - out);
    int digits = 6;
    for (; fraction % 10U == 0; --digits) fraction /= 10U;
    *end = '.';
    for (int i = digits; i > 0; --i, fraction /= 10U) end[i] = static_cast<char>('0' + fraction % 10U);
    return static_cast<std::size_t>(end + 1 + digits - out);
}

/// The fewest digits that give `value` back, which is positive.
decimal_digits shortest_digits(double value) {
    std::array<char, k_number_text_size> text{};
    const char* const end =
        std::to_chars(text.data(), text.data() + text.size(), value, std::chars_format::scientific).ptr;
    decimal_digits result;
    const char* at = text.data();
    for (; *at != 'e'; ++at) {
        if (*at != '.') result.digit[static_cast<std::size_t>(result.count++)] = *at;
    }
    const bool negative = at[1] == '-';
    std::from_chars(at + 2, end, result.exponent);
    if (negative) result.exponent = -result.exponent;
    return result;
}

/// Rounds the shortest digits of `value` to 14 if that surely gives what rounding `value` itself does.
///
/// More than 14 digits: a half-way point between two neighbours of 14 digits has 15. If it lay between
/// `value` and its shortest digits it would give `value` back too, and be shorter, or as short and nearer: so
/// they lie on the same side of it, unless they are that point. Up to 14 digits: they lie within half a unit
/// in the last place of `value`, and for a normal number 14 digits are coarser than that.
bool round_to_14(decimal_digits& digits, double value) {
    if (digits.count <= k_double_digits) return value >= std::numeric_limits<double>::min();
    const char next = digits.digit[k_double_digits];
    if (digits.count == k_double_digits + 1 && next == '5') return false;
    digits.count = k_double_digits;
    if (next < '5') return true;
    std::size_t last = k_double_digits - 1;
    while (last != 0 && digits.digit[last] == '9') digits.digit[last--] = '0';
    if (digits.digit[last] == '9') {
        digits.digit[last] = '1';
        ++digits.exponent;
    } else {
        ++digits.digit[last];
    }
    return true;
}

/// The layout of "%g": with an exponent below 10^-4 and from 10^14 on, no trailing zeros behind the point.
std::size_t put_general(char* out, decimal_digits& digits) {
    const char* const first = digits.digit.data();
    int count = digits.count;
    while (count > 1 && first[count - 1] == '0') --count;
    const auto put_digits = [&](char* to, int from, int until) {
        for (int i = from; i < until; ++i) *to++ = i < count ? first[i] : '0';
        return to;
    };
    char* at = out;
    if (digits.exponent < -4 || digits.exponent >= k_double_digits) {
        *at++ = first[0];
        if (count > 1) *at++ = '.';
        at = put_digits(at, 1, count);
        *at++ = 'e';
        *at++ = digits.exponent < 0 ? '-' : '+';
        const int magnitude = std::abs(digits.exponent);
        if (magnitude < 10) *at++ = '0';
        at = std::to_chars(at, out + k_number_text_size, magnitude).ptr;
    } else if (digits.exponent < 0) {
        *at++ = '0';
        *at++ = '.';
        for (int i = -1; i > digits.exponent; --i) *at++ = '0';
        at = put_digits(at, 0, count);
    } else {
        const int whole = digits.exponent + 1;
        at = put_digits(at, 0, whole);
        if (count > whole) *at++ = '.';
        at = put_digits(at, whole, count);
    }
    return static_cast<std::size_t>(at - out);
}

}  // namespace

double text_to_double(const std::string& text) { return text_to_double(text.data(), text.size()); }
double text_to_double(const char* text, std::size_t size) {
    const std::string_view view(text, size);
    if (view == "NaN") return float_zero() / float_zero();
    if (view == "INF") return 1.0 / float_zero();
    if (view == "-INF") return -1.0 / float_zero();
    // from_chars rounds as atof does. It is trusted with texts that begin as plain numbers and that it reads
    // to their end; blanks, "+", hexadecimal, names, rubbish, and what does not fit go the long way.
    const bool negative = size != 0 && text[0] == '-';
    const std::size_t start = negative ? 1 : 0;
    if (start < size && (is_ascii_digit(text[start]) || text[start] == '.')) {
        double value = 0.0;
        const auto read = std::from_chars(text, text + size, value);
        if (read.ec == std::errc() && read.ptr == text + size) return value;
    }
    return by_atof(text, size);
}

int text_to_int(const std::string& text) { return text_to_int(text.data(), text.size()); }
int text_to_int(const char* text, std::size_t size) {
    constexpr std::int64_t k_max = std::numeric_limits<std::int32_t>::max();
    text_cursor cursor(text, size);
    skip_spaces(cursor);
    const bool negative = cursor.accept_sign();
    const auto magnitude = static_cast<std::int64_t>(read_magnitude(cursor, k_max + (negative ? 1 : 0)));
    return static_cast<int>(negative ? -magnitude : magnitude);
}

unsigned long text_to_unsigned_long(const std::string& text) {
    return text_to_unsigned_long(text.data(), text.size());
}
unsigned long text_to_unsigned_long(const char* text, std::size_t size) {
    constexpr std::uint64_t k_max = std::numeric_limits<std::uint32_t>::max();
    text_cursor cursor(text, size);
    skip_spaces(cursor);
    const bool negative = cursor.accept_sign();
    const std::uint64_t magnitude = read_magnitude(cursor, k_max + 1);
    if (magnitude > k_max) return k_max;
    const auto value = static_cast<std::uint32_t>(magnitude);
    return negative ? 0U - value : value;
}

bool text_to_bool(const std::string& text) { return text_to_bool(text.data(), text.size()); }
bool text_to_bool(const char* text, std::size_t size) {
    const std::string_view view(text, size);
    return view == "true" || view == "1";
}

std::size_t format_general(char* out, double value, int precision) {
    const auto written =
        std::to_chars(out, out + k_number_text_size, value, std::chars_format::general, precision);
    return static_cast<std::size_t>(written.ptr - out);
}

std::size_t format_double(char* out, double value) {
    if (const std::size_t size = format_special(out, value)) return size;
    const std::size_t sign = value < 0 ? 1 : 0;
    if (sign) *out = '-';
    const double magnitude = std::fabs(value);
    if (const std::size_t size = format_millionths(out + sign, magnitude)) return sign + size;
    decimal_digits digits = shortest_digits(magnitude);
    if (round_to_14(digits, magnitude)) return sign + put_general(out + sign, digits);
    return format_general(out, value, k_double_digits);
}

std::size_t format_float(char* out, float value) {
    if (const std::size_t size = format_special(out, static_cast<double>(value))) return size;
    return format_general(out, static_cast<double>(value), k_float_digits);
}

void append_double(std::string& out, double value) {
    std::array<char, k_number_text_size> text;
    out.append(text.data(), format_double(text.data(), value));
}

void append_float(std::string& out, float value) {
    std::array<char, k_number_text_size> text;
    out.append(text.data(), format_float(text.data(), value));
}

void append_int(std::string& out, int value) {
    std::array<char, k_number_text_size> text;
    out.append(text.data(), std::to_chars(text.data(), text.data() + text.size(), value).ptr);
}

void append_unsigned(std::string& out, unsigned int value) {
    std::array<char, k_number_text_size> text;
    out.append(text.data(), std::to_chars(text.data(), text.data() + text.size(), value).ptr);
}

}  // namespace qbxV2
