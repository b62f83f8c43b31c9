#pragma once

#include <cstddef>
#include <string>

#include "runtime/text_conversions.h"  // float_zero

namespace qbxV2 {

/// For the rooms of the library; nothing of this header is exported.

/// Text to numbers, as the reader does it once a check of "text_checks.h" has passed. Nothing is refused: a
/// text that is no number gives what its beginning gives, or zero. The decimal mark is a point, whatever the
/// process's locale. Each comes for a string and for `size` bytes at `text`, which need no terminator. Any
/// thread.

/// "NaN", "INF" and "-INF"; any other text as `atof` reads it, so too large a number is infinite.
double text_to_double(const std::string& text);
double text_to_double(const char* text, std::size_t size);

/// As `atoi` reads it, held at the ends of 32 bits when the number passes them.
int text_to_int(const std::string& text);
int text_to_int(const char* text, std::size_t size);

/// As `strtoul` reads it in base 10 where `unsigned long` has 32 bits: 4294967295 when the number passes
/// that, and a "-" negates modulo 2^32.
unsigned long text_to_unsigned_long(const std::string& text);
unsigned long text_to_unsigned_long(const char* text, std::size_t size);

/// True for "true" and "1", false for every other text.
bool text_to_bool(const std::string& text);
bool text_to_bool(const char* text, std::size_t size);

/// Room that `format_double` and `format_float` need. They write no terminator.
inline constexpr std::size_t k_number_text_size = 32;

/// Writes `value` to `out` as XML text and returns the number of bytes: "NaN", "INF", "-INF", "0.0", "-0.0",
/// or what `printf` gives for "%.14g" (double) and "%.7g" (float) in the classic locale.
std::size_t format_double(char* out, double value);
std::size_t format_float(char* out, float value);

/// Writes `value` to `out` as `printf` does for "%.<precision>g" in the classic locale, `precision` being 1
/// to 17, and returns the number of bytes. `value` must be finite.
std::size_t format_general(char* out, double value, int precision);

void append_double(std::string& out, double value);
void append_float(std::string& out, float value);
void append_int(std::string& out, int value);
void append_unsigned(std::string& out, unsigned int value);

namespace detail {

/// The text with its first point replaced, where the process's decimal mark begins with a comma.
std::string with_decimal_mark(std::string text, const char* decimal_mark);

}  // namespace detail
}  // namespace qbxV2
