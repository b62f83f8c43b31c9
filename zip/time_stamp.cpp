#include "zip/time_stamp.h"

#include <algorithm>

#include "platform/clock.h"

namespace ZipArchiveLib {
namespace {

// std::tm counts years from 1900, DOS from 1980.
constexpr int k_firstYear = 80;
constexpr int k_largestYearField = 127;

}  // namespace

TimeStamp TimeStampFromTime(std::int64_t time) {
    std::tm parts = {};
    if (!vrl_platform::local_time(time, parts)) return {};
    const int year = std::clamp(parts.tm_year - k_firstYear, 0, k_largestYearField);
    TimeStamp stamp;
    stamp.date = static_cast<std::uint16_t>((year << 9) | ((parts.tm_mon + 1) << 5) | parts.tm_mday);
    stamp.time = static_cast<std::uint16_t>((parts.tm_hour << 11) | (parts.tm_min << 5) | (parts.tm_sec / 2));
    return stamp;
}

std::int64_t TimeFromTimeStamp(TimeStamp stamp) {
    std::tm parts = {};
    parts.tm_sec = (stamp.time & 0x1F) * 2;
    parts.tm_min = (stamp.time >> 5) & 0x3F;
    parts.tm_hour = stamp.time >> 11;
    parts.tm_mday = stamp.date & 0x1F;
    parts.tm_mon = ((stamp.date >> 5) & 0x0F) - 1;
    parts.tm_year = (stamp.date >> 9) + k_firstYear;
    return vrl_platform::time_from_local(parts);
}

}  // namespace ZipArchiveLib
