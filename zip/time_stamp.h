#pragma once

#include <cstdint>

namespace ZipArchiveLib {

/// A local time in the form of DOS: two seconds fine, from 1980 on. (APPNOTE 4.4.6)
struct TimeStamp {
    std::uint16_t time = 0;
    std::uint16_t date = 0;
};

/// From seconds since 1970. A year before 1981 gives the year field 0 and one after 2107 the last there is;
/// a time that cannot be told gives zeros.
TimeStamp TimeStampFromTime(std::int64_t time);

/// To seconds since 1970; fields out of range are carried over. -1 when it cannot be told.
std::int64_t TimeFromTimeStamp(TimeStamp stamp);

}  // namespace ZipArchiveLib
