#include <cstdlib>

#include "V2/frame/reading.h"

namespace vrl_v2::frame {

using qbxV2::EQBX_VALUE_BAD_FORMAT;

bool reporting::store(const std::string& text, double& value, no_limits, const std::string& item, int line) {
    if (!expect(qbxV2::is_valid_float(text), EQBX_VALUE_BAD_FORMAT, item, line)) return false;
    value = qbxV2::text_to_double(text);
    return true;
}

bool reporting::store(const std::string& text, double& value, const range& limits, const std::string& item,
                      int line) {
    return store(text, value, no_limits(), item, line) && expect(limits.check_low(value), item, line) &&
           expect(limits.check_high(value), item, line);
}

bool reporting::store(const std::string& text, bool& value, no_limits, const std::string& item, int line) {
    if (!expect(qbxV2::is_valid_bool(text), EQBX_VALUE_BAD_FORMAT, item, line)) return false;
    value = qbxV2::text_to_bool(text);
    return true;
}

bool reporting::expect_whole(const std::string& text, const whole& limits, const std::string& item,
                             int line) {
    return expect(qbxV2::is_valid_integer(text), EQBX_VALUE_BAD_FORMAT, item, line) &&
           expect(limits.check_low(text), item, line) && expect(limits.check_high(text), item, line);
}

bool reporting::store(const std::string& text, int& value, const whole& limits, const std::string& item,
                      int line) {
    if (!expect_whole(text, limits, item, line)) return false;
    value = qbxV2::text_to_int(text);
    return true;
}

bool reporting::store(const std::string& text, unsigned& value, const whole& limits, const std::string& item,
                      int line) {
    if (!expect_whole(text, limits, item, line)) return false;
    value = static_cast<unsigned>(qbxV2::text_to_unsigned_long(text));
    return true;
}

bool reporting::store(const std::string& text, unsigned char& value, const whole& limits,
                      const std::string& item, int line) {
    if (!expect_whole(text, limits, item, line)) return false;
    value = static_cast<unsigned char>(qbxV2::text_to_unsigned_long(text));
    return true;
}

bool reporting::store(const std::string& text, std::wstring& value, no_limits, const std::string&, int) {
    qbxV2::vtostring(value, text);
    return true;
}

bool reporting::store(const std::string& text, std::wstring& value, const length& limits,
                      const std::string& item, int line) {
    // The reader measures the text as it was read, in characters; the setter counts stored units.
    const bool long_enough = limits.min == 0 || qbxV2::is_min_length_ok(text, limits.min);
    if (!expect(long_enough, qbxV2::EQBX_LENGTH_TOO_SHORT, item, line)) return false;
    if (!expect(qbxV2::is_max_length_ok(text, limits.max), qbxV2::EQBX_LENGTH_TOO_LONG, item, line)) {
        return false;
    }
    qbxV2::vtostring(value, text);
    return true;
}

bool reporting::store(const std::string& text, std::wstring& value, const literals& limits,
                      const std::string& item, int line) {
    qbxV2::vtostring(value, text);
    return expect(limits.check(value), item, line);
}

bool reporting::store(const std::string& text, qbxV2::c_datetime& value, no_limits, const std::string& item,
                      int line) {
    if (!expect(qbxV2::c_datetime::is_valid(text), EQBX_VALUE_BAD_FORMAT, item, line)) return false;
    // The pattern of the format's date-times: ".+T.+(Z|[+\-].+)". Only reading applies it.
    if (!expect(qbxV2::has_time_and_zone(text), qbxV2::EQBX_NO_PATTERN_MATCHED, item, line)) return false;
    value = text;
    return true;
}

bool reporting::store(const std::string& text, qbxV2::c_binary& value, no_limits, const std::string& item,
                      int line) {
    const bool valid = qbxV2::c_binary::is_valid_base64(text);
    if (!expect(valid, EQBX_VALUE_BAD_FORMAT, item, line)) return false;
    value.from_base64(text);
    return true;
}

}  // namespace vrl_v2::frame
