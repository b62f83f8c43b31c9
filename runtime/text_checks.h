#pragma once

#include <cstddef>
#include <string>

#include "platform/api.h"

namespace qbxV2 {

/// Checks that a text must pass before it is converted, and the measures behind length and digit facets.
///
/// Result   false is not yet an error: the caller picks the code (mostly EQBX_VALUE_BAD_FORMAT).
/// Cost     one pass at most, no allocation. Any thread. Only ASCII digits are digits.
///
/// Each check comes for a string and for `size` bytes at `text`, which need no terminator.

/// Exactly "true", "1", "false" or "0".
[[nodiscard]] VRL_API bool is_valid_bool(const std::string& text);
[[nodiscard]] VRL_API bool is_valid_bool(const char* text, std::size_t size);

/// An optional sign and at least one digit. A zero byte ends the text: what stands behind it is not looked
/// at. The range is not checked.
[[nodiscard]] VRL_API bool is_valid_integer(const std::string& text);
[[nodiscard]] VRL_API bool is_valid_integer(const char* text, std::size_t size);

/// Shape    an optional sign; digits with at most one point and a digit before or after it; optionally `e` or
/// `E`,
///          a sign, digits. Or exactly `INF`, `-INF`, `NaN`. No blanks.
/// Range    not checked: "1e999" passes, and converts to infinity.
/// Source   XML Schema Part 2, 3.2.5 double: the lexical forms, less the blanks.
[[nodiscard]] VRL_API bool is_valid_float(const std::string& text);
[[nodiscard]] VRL_API bool is_valid_float(const char* text, std::size_t size);

/// Characters of a UTF-8 text, by its lead bytes alone. A pair of surrogates in three-byte form counts as one
/// character. A byte that begins no sequence is counted and ends the count.
[[nodiscard]] VRL_API unsigned int length(const std::string& text);
[[nodiscard]] VRL_API unsigned int length(const char* text, std::size_t size);

/// Whether `length(text)` is at least `min` / at most `max`; the text is walked only when its size in bytes
/// does not decide.
[[nodiscard]] VRL_API bool is_min_length_ok(const std::string& text, unsigned int min);
[[nodiscard]] VRL_API bool is_min_length_ok(const char* text, std::size_t size, unsigned int min);
[[nodiscard]] VRL_API bool is_max_length_ok(const std::string& text, unsigned int max);
[[nodiscard]] VRL_API bool is_max_length_ok(const char* text, std::size_t size, unsigned int max);

/// All digits of the text, leading and trailing zeros included.
[[nodiscard]] VRL_API int total_digits(const std::string& text);
/// All digits behind the first point. So "1.5e3" has 2.
[[nodiscard]] VRL_API int fraction_digits(const std::string& text);

}  // namespace qbxV2
