#pragma once

#include <cstddef>

#include "runtime/date_time_record.h"

namespace qbxV2::detail {

/// Whether the `size` bytes at `text` have the form of a date or time value:
///
///   EDT_DATE       [+-]yyyy-mm-dd        EDT_GDAY       ---dd
///   EDT_DATETIME   [+-]yyyy-mm-ddTime    EDT_GMONTH     --mm--
///   EDT_TIME       [+-]hh:mm:ss[.s]      EDT_GMONTHDAY  --mm-dd
///   EDT_GYEAR      [+-]yyyy              EDT_GYEARMONTH [+-]yyyy-mm
///
/// each with nothing, "Z", or a sign and "hh:mm" behind it. A year has four digits or more; behind the point
/// of the seconds stands any number of digits, or none. Ranges are not tested.
bool has_date_time_form(edatetime_kind kind, const char* text, std::size_t size);

}  // namespace qbxV2::detail
