#pragma once

#include <cstddef>
#include <iosfwd>

#include "runtime/date_time_record.h"

namespace qbxV2::detail {

/// Room that `format_date_time` and `format_seconds` need.
inline constexpr std::size_t k_date_time_text_size = 160;

/// Writes the value to `out` at precision 6 in the classic locale, without a terminator, and returns the end.
char* format_date_time(edatetime_kind kind, const s_datetime_record& record, char* out);

/// The same through the stream's own operators at its own precision, flags and locale.
void stream_date_time(edatetime_kind kind, const s_datetime_record& record, std::ostream& os);

/// Seconds as such, without padding: six significant digits, or six behind the point if they are below 0.001.
char* format_seconds(float secs, char* out);

/// The same at the stream's precision. Its fixed notation is switched off afterwards.
void stream_seconds(float secs, std::ostream& os);

}  // namespace qbxV2::detail
