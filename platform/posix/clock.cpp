#include "platform/clock.h"

namespace vrl_platform {
namespace {

class posix_clock : public clock {
public:
    std::int64_t now() override { return static_cast<std::int64_t>(std::time(nullptr)); }
};

}  // namespace

clock& native_clock() {
    static posix_clock the_clock;
    return the_clock;
}

bool local_time(std::int64_t time, std::tm& parts) {
    const auto seconds = static_cast<std::time_t>(time);
    if (seconds != time) return false;
    std::tm found = {};
    if (::localtime_r(&seconds, &found) == nullptr) return false;
    parts = found;
    return true;
}

std::int64_t time_from_local(const std::tm& parts) {
    std::tm given = parts;
    given.tm_isdst = -1;
    return static_cast<std::int64_t>(std::mktime(&given));
}

}  // namespace vrl_platform
