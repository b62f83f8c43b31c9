#include "runtime/number_text.h"

#include <algorithm>
#include <array>
#include <cfloat>
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

/// The defined way: `atof`, whose point is the process's decimal mark.
double by_atof(const char* text, std::size_t size) {
    const std::string copy =
        detail::with_decimal_mark(std::string(text, size), std::localeconv()->decimal_point);
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

/// The powers of ten that `double` holds exactly.
constexpr std::array<double, 23> k_powers = {1e0,  1e1,  1e2,  1e3,  1e4,  1e5,  1e6,  1e7,
                                             1e8,  1e9,  1e10, 1e11, 1e12, 1e13, 1e14, 1e15,
                                             1e16, 1e17, 1e18, 1e19, 1e20, 1e21, 1e22};

/// The point stands behind the first of `digits`; the whole is multiplied by ten to `exponent`.
struct rounded_number {
    std::uint64_t digits = 0;
    int exponent = 0;
};

/// `digits`, which is not 0 and below 10^16, without the zeros at its end.
std::uint64_t without_trailing_zeros(std::uint64_t digits) {
    if (digits % 100000000U == 0) digits /= 100000000U;
    if (digits % 10000U == 0) digits /= 10000U;
    if (digits % 100U == 0) digits /= 100U;
    return digits % 10U == 0 ? digits / 10U : digits;
}

/// The power of ten below `value`, which is positive and normal, or the one below that.
int estimate_exponent(double value) {
    constexpr int k_mantissa_bits = 52;
    constexpr int k_bias = 1023;
    std::uint64_t bits = 0;
    std::memcpy(&bits, &value, sizeof bits);
    const int binary = static_cast<int>(bits >> k_mantissa_bits) - k_bias;
    return (binary * 78913) >> 18;  // times log10(2), rounded down
}

/// Rounds `value`, which is positive, to `precision` digits, 1 to 14. False when that needs more than one
/// exact power of ten, or when the product with it does not tell for sure.
///
/// The product is below 10^14, and so off by 1/128 at most: if its fraction is farther than that from one
/// half, it rounds to the whole number that the exact product rounds to. Near a power of ten the product may
/// come out on the wrong side of it; both sides then give the same digits.
bool round_to_digits(double value, int precision, rounded_number& result) {
    constexpr double k_doubt = 1.0 / 64;
    const auto places = static_cast<std::size_t>(precision);
    int exponent = estimate_exponent(value);
    auto scale = static_cast<std::size_t>(precision - 1 - exponent);  // huge if negative
    if (scale >= k_powers.size()) return false;
    double product = value * k_powers[scale];
    if (product >= k_powers[places]) {
        if (scale == 0) return false;
        ++exponent;
        product = value * k_powers[--scale];
    }
    auto digits = static_cast<std::uint64_t>(product);
    const double fraction = product - static_cast<double>(digits);
    if (std::fabs(fraction - 0.5) < k_doubt) return false;
    if (fraction > 0.5) ++digits;
    const bool carries = static_cast<double>(digits) == k_powers[places];
    result = {without_trailing_zeros(digits), carries ? exponent + 1 : exponent};
    return true;
}

/// The layout of "%g": an exponent below 10^-4 and from 10^precision on, and no trailing zeros behind the
/// point.
std::size_t put_general(char* out, const rounded_number& number, int precision) {
    std::array<char, 24> text;
    const char* const last = std::to_chars(text.data(), text.data() + text.size(), number.digits).ptr;
    const int exponent = number.exponent;
    const char* const first = text.data();
    const auto count = static_cast<int>(last - first);
    char* at = out;
    if (exponent < -4 || exponent >= precision) {
        *at++ = *first;
        if (count > 1) *at++ = '.';
        at = std::copy(first + 1, last, at);
        *at++ = 'e';
        *at++ = exponent < 0 ? '-' : '+';
        const int magnitude = std::abs(exponent);
        if (magnitude < 10) *at++ = '0';
        at = std::to_chars(at, out + k_number_text_size, magnitude).ptr;
    } else if (exponent < 0) {
        at = std::fill_n(std::copy_n("0.", 2, at), -1 - exponent, '0');
        at = std::copy(first, last, at);
    } else if (count <= exponent + 1) {
        at = std::fill_n(std::copy(first, last, at), exponent + 1 - count, '0');
    } else {
        at = std::copy_n(first, exponent + 1, at);
        *at++ = '.';
        at = std::copy(first + exponent + 1, last, at);
    }
    return static_cast<std::size_t>(at - out);
}

/// Reads digits, with a point among them or not, behind a "-" or not. False for other texts, and when the
/// digits without their point are more than a whole `double`.
///
/// Both the digits and the power of ten that the point stands for are exact, so their quotient is rounded
/// once, as it has to be. Source: W. D. Clinger, How to Read Floating Point Numbers Accurately, 1990.
bool read_exact_decimal(const char* text, std::size_t size, double& value) {
    constexpr std::size_t k_most_characters = 19;  // that many digits fit 64 bits
    constexpr std::uint64_t k_largest_whole = std::uint64_t{1} << std::numeric_limits<double>::digits;
    if (FLT_EVAL_METHOD != 0 || size == 0 || size > k_most_characters) return false;
    const char* const end = text + size;
    const char* const first = *text == '-' ? text + 1 : text;
    const char* point = nullptr;
    std::uint64_t digits = 0;
    for (const char* at = first; at != end; ++at) {
        if (is_ascii_digit(*at)) {
            digits = digits * 10U + static_cast<std::uint64_t>(*at - '0');
        } else if (*at == '.' && point == nullptr) {
            point = at;
        } else {
            return false;
        }
    }
    const bool has_digits = end - first > (point == nullptr ? 0 : 1);
    if (!has_digits || digits > k_largest_whole) return false;
    const auto places = point == nullptr ? 0U : static_cast<std::size_t>(end - point - 1);
    const double magnitude = static_cast<double>(digits) / k_powers[places];
    value = first == text ? magnitude : -magnitude;
    return true;
}

}  // namespace

std::string detail::with_decimal_mark(std::string text, const char* decimal_mark) {
    if (decimal_mark[0] != ',') return text;
    const std::size_t point = text.find('.');
    if (point != std::string::npos) text[point] = ',';
    return text;
}

double text_to_double(const std::string& text) { return text_to_double(text.data(), text.size()); }
double text_to_double(const char* text, std::size_t size) {
    double value = 0.0;
    if (read_exact_decimal(text, size, value)) return value;
    const std::string_view view(text, size);
    if (view == "NaN") return float_zero() / float_zero();
    if (view == "INF") return 1.0 / float_zero();
    if (view == "-INF") return -1.0 / float_zero();
    // from_chars rounds as atof does. It is trusted with texts that begin as plain numbers and that it reads
    // to their end; blanks, "+", hexadecimal, names, rubbish, and what does not fit go the long way.
    const bool negative = size != 0 && text[0] == '-';
    const std::size_t start = negative ? 1 : 0;
    if (start < size && (is_ascii_digit(text[start]) || text[start] == '.')) {
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
    const double magnitude = std::fabs(value);
    rounded_number number;
    if (precision <= k_double_digits && std::isnormal(value) &&
        round_to_digits(magnitude, precision, number)) {
        const std::size_t sign = value < 0 ? 1 : 0;
        if (sign) *out = '-';
        return sign + put_general(out + sign, number, precision);
    }
    const auto written =
        std::to_chars(out, out + k_number_text_size, value, std::chars_format::general, precision);
    return static_cast<std::size_t>(written.ptr - out);
}

std::size_t format_double(char* out, double value) {
    if (const std::size_t size = format_special(out, value)) return size;
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
