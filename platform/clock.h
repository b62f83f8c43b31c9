#pragma once

#include <cstdint>
#include <ctime>

namespace vrl_platform {

class clock {
public:
    clock() = default;
    clock(const clock&) = delete;
    clock& operator=(const clock&) = delete;
    virtual ~clock() = default;

    /// Seconds since 1970, UTC.
    virtual std::int64_t now() = 0;
};

/// The system's own clock. Lives as long as the process.
clock& native_clock();

/// A time in the process's time zone. False when it cannot be told there; then `parts` is unchanged.
bool local_time(std::int64_t time, std::tm& parts);

/// The way back; parts out of range are carried over, daylight saving is the zone's to know. -1 when the
/// time cannot be told.
std::int64_t time_from_local(const std::tm& parts);

}  // namespace vrl_platform
