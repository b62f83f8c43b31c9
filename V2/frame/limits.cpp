#include "V2/frame/limits.h"

#include <cstdlib>

namespace vrl_v2::frame {

eqbx_error whole::check(long long v) const {
    if (v < std::strtoll(low, nullptr, 10)) return qbxV2::EQBX_VALUE_TOO_SMALL;
    return v > std::strtoll(high, nullptr, 10) ? qbxV2::EQBX_VALUE_TOO_LARGE : qbxV2::EQBX_NO_ERROR;
}

eqbx_error whole::check_low(const std::string& digits) const {
    return digits >= qbxV2::c_big_int(low) ? qbxV2::EQBX_NO_ERROR : qbxV2::EQBX_VALUE_TOO_SMALL;
}

eqbx_error whole::check_high(const std::string& digits) const {
    return digits <= qbxV2::c_big_int(high) ? qbxV2::EQBX_NO_ERROR : qbxV2::EQBX_VALUE_TOO_LARGE;
}

}  // namespace vrl_v2::frame
