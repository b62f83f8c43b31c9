#include "runtime/text_checks.h"

#include <cstdint>
#include <string_view>

#include "runtime/text_cursor.h"

namespace qbxV2 {

using detail::is_ascii_digit;
using detail::text_cursor;

namespace {

/// Bytes of the sequence that begins with `lead`, 0 if none does.
std::size_t sequence_length(unsigned char lead) {
    if (lead < 0x80) return 1;
    if ((lead & 0xE0) == 0xC0) return 2;
    if ((lead & 0xF0) == 0xE0) return 3;
    if ((lead & 0xF8) == 0xF0) return 4;
    return 0;
}

}  // namespace

bool is_valid_bool(const std::string& text) { return is_valid_bool(text.data(), text.size()); }
bool is_valid_bool(const char* text, std::size_t size) {
    const std::string_view view(text, size);
    return view == "true" || view == "1" || view == "false" || view == "0";
}

bool is_valid_integer(const std::string& text) { return is_valid_integer(text.data(), text.size()); }
bool is_valid_integer(const char* text, std::size_t size) {
    text_cursor cursor(text, size);
    cursor.accept_sign();
    // Intended: the scan ends at a zero byte as it does at the end.
    return cursor.skip_digits() != 0 && (cursor.at_end() || cursor.accept('\0'));
}

bool is_valid_float(const std::string& text) { return is_valid_float(text.data(), text.size()); }
bool is_valid_float(const char* text, std::size_t size) {
    text_cursor cursor(text, size);
    cursor.accept_sign();
    if (!cursor.accept_mantissa()) {
        const std::string_view view(text, size);
        return view == "INF" || view == "-INF" || view == "NaN";
    }
    if (cursor.accept('e') || cursor.accept('E')) {
        cursor.accept_sign();
        if (cursor.skip_digits() == 0) return false;
    }
    return cursor.at_end();
}

unsigned int length(const std::string& text) { return length(text.data(), text.size()); }
unsigned int length(const char* text, std::size_t size) {
    unsigned int count = 0;
    for (std::size_t i = 0; i < size;) {
        const auto lead = static_cast<unsigned char>(text[i]);
        ++count;
        std::size_t step = sequence_length(lead);
        if (step == 0) return count;
        // 0xED with 0xA0 to 0xBF behind it is a surrogate; it is taken to have its partner behind it.
        if (lead == 0xED && i + 1 < size && (static_cast<unsigned char>(text[i + 1]) & 0xE0) == 0xA0)
            step = 6;
        i += step;
    }
    return count;
}

bool is_min_length_ok(const std::string& text, unsigned int min) {
    return is_min_length_ok(text.data(), text.size(), min);
}
bool is_min_length_ok(const char* text, std::size_t size, unsigned int min) {
    if (size >= std::uint64_t{4} * min) return true;
    return length(text, size) >= min;
}

bool is_max_length_ok(const std::string& text, unsigned int max) {
    return is_max_length_ok(text.data(), text.size(), max);
}
bool is_max_length_ok(const char* text, std::size_t size, unsigned int max) {
    if (size <= max) return true;
    if (size > std::uint64_t{4} * max) return false;
    return length(text, size) <= max;
}

int total_digits(const std::string& text) {
    int count = 0;
    for (const char c : text) count += is_ascii_digit(c) ? 1 : 0;
    return count;
}

int fraction_digits(const std::string& text) {
    const std::size_t point = text.find('.');
    if (point == std::string::npos) return 0;
    int count = 0;
    for (std::size_t i = point + 1; i < text.size(); ++i) count += is_ascii_digit(text[i]) ? 1 : 0;
    return count;
}

}  // namespace qbxV2
