#pragma once

namespace qbxV2 {

/// The fields that all date and time values share, used or not. Nothing is in a range: no calendar is kept.
struct s_datetime_record {
    int year = 1;
    unsigned int month = 0;
    unsigned int day = 0;
    unsigned int hours = 0;
    unsigned int mins = 0;
    float secs = 0.0F;
    int total_offset_mins = 0;  ///< minutes east of UTC
    bool is_utc = false;        ///< written "Z", whatever the offset
};

/// Which fields a date or time value writes, reads and checks, and how.
enum edatetime_kind : int {
    EDT_DATE,
    EDT_DATETIME,
    EDT_TIME,
    EDT_GDAY,
    EDT_GMONTH,
    EDT_GMONTHDAY,
    EDT_GYEAR,
    EDT_GYEARMONTH,
};

}  // namespace qbxV2
