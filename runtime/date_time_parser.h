#pragma once

#include <cstddef>

#include "runtime/date_time_record.h"

namespace qbxV2::detail {

/// Reads the `size` bytes at `text` in the order of the form of `kind`, storing each field as it is met, and
/// stops at the first thing that does not fit. Fields that are not met keep their values; a run of digits of
/// the wrong length is stored before the parser stops at it. Whole numbers are taken modulo 2^32.
///
/// The sign of a year is applied last: behind the seconds of a date-time, behind the zone of other forms.
void parse_date_time(edatetime_kind kind, const char* text, std::size_t size, s_datetime_record& record);

}  // namespace qbxV2::detail
