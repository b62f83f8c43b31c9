#include "tests/driver/facet_values.h"

#include <cmath>
#include <cstdio>
#include <limits>

namespace vrl_driver {
namespace {

constexpr int k_ok = qbxV2::EQBX_NO_ERROR;
constexpr int k_small = qbxV2::EQBX_VALUE_TOO_SMALL;
constexpr int k_large = qbxV2::EQBX_VALUE_TOO_LARGE;
constexpr int k_form = qbxV2::EQBX_VALUE_BAD_FORMAT;

std::string exactly(double value) {
    char text[40];
    std::snprintf(text, sizeof text, "%.17g", value);
    return text;
}

std::string next_to(const char* bound, double towards) {
    return exactly(std::nextafter(std::stod(bound), towards));
}

void add_number_bounds(std::vector<facet_value>& values, const facets& limits) {
    const double infinity = std::numeric_limits<double>::infinity();
    if (limits.min_inclusive != nullptr) {
        values.push_back({limits.min_inclusive, k_ok, k_ok});
        values.push_back({next_to(limits.min_inclusive, -infinity), k_small, k_small});
    }
    if (limits.min_exclusive != nullptr) {
        values.push_back({limits.min_exclusive, k_small, k_small});
        values.push_back({next_to(limits.min_exclusive, infinity), k_ok, k_ok});
    }
    if (limits.max_inclusive != nullptr) {
        values.push_back({limits.max_inclusive, k_ok, k_ok});
        values.push_back({next_to(limits.max_inclusive, infinity), k_large, k_large});
    }
    if (limits.max_exclusive != nullptr) {
        values.push_back({limits.max_exclusive, k_large, k_large});
        values.push_back({next_to(limits.max_exclusive, -infinity), k_ok, k_ok});
    }
    const bool low = limits.min_inclusive != nullptr || limits.min_exclusive != nullptr;
    const bool high = limits.max_inclusive != nullptr || limits.max_exclusive != nullptr;
    const int for_nan = low ? k_small : high ? k_large : k_ok;
    values.push_back({"NaN", for_nan, for_nan});
    values.push_back({"INF", high ? k_large : k_ok, high ? k_large : k_ok});
    values.push_back({"-INF", low ? k_small : k_ok, low ? k_small : k_ok});
}

void add_whole_bounds(std::vector<facet_value>& values, const member& m) {
    if (m.value == value_type::byte) {
        values.push_back({"1", k_small, k_small});
        values.push_back({"2", k_ok, k_ok});
        values.push_back({"99", k_ok, k_ok});
        values.push_back({"100", k_large, k_large});
        values.push_back({"258", -1, k_large});
        return;
    }
    const bool is_signed = m.value == value_type::integer;
    values.push_back({is_signed ? "-2147483648" : "0", k_ok, k_ok});
    values.push_back({is_signed ? "-2147483649" : "-1", -1, k_small});
    values.push_back({"2147483647", k_ok, k_ok});
    values.push_back({"2147483648", is_signed ? -1 : k_large, k_large});
    values.push_back({"+0007", k_ok, k_ok});
    values.push_back({"99999999999999999999999999", -1, k_large});
    values.push_back({"-99999999999999999999999999", -1, k_small});
}

void add_texts(std::vector<facet_value>& values, const facets& limits) {
    if (!limits.literals.empty()) {
        for (const char* literal : limits.literals) values.push_back({literal, k_ok, k_ok});
        const int refused = qbxV2::EQBX_VALUE_NOT_ENUMERATED;
        values.push_back({std::string(limits.literals[0]) + "x", refused, refused});
        values.push_back({"", refused, refused});
        return;
    }
    const bool at_least_one = limits.min_length == 1;
    values.push_back({"", at_least_one ? qbxV2::EQBX_LENGTH_TOO_SHORT : k_ok,
                      at_least_one ? qbxV2::EQBX_LENGTH_TOO_SHORT : k_ok});
    values.push_back({"a", k_ok, k_ok});
    if (limits.max_length >= 0) {
        const std::string longest(static_cast<std::size_t>(limits.max_length), 'a');
        values.push_back({longest + "b", qbxV2::EQBX_LENGTH_TOO_LONG, qbxV2::EQBX_LENGTH_TOO_LONG});
    }
}

void add_malformed(std::vector<facet_value>& values, std::initializer_list<const char*> texts) {
    for (const char* text : texts) values.push_back({text, -1, k_form});
}

}  // namespace

std::vector<facet_value> facet_values(const member& m) {
    std::vector<facet_value> values;
    switch (m.value) {
        case value_type::number:
            add_number_bounds(values, m.limits);
            add_malformed(values, {"", "one", "1,5", "1e", "0x10", "+INF"});
            break;
        case value_type::text:
            add_texts(values, m.limits);
            break;
        case value_type::boolean:
            for (const char* text : {"true", "false", "1", "0"}) values.push_back({text, k_ok, k_ok});
            add_malformed(values, {"", "TRUE", "yes", "2"});
            break;
        case value_type::integer:
        case value_type::unsigned_integer:
        case value_type::byte:
            add_whole_bounds(values, m);
            add_malformed(values, {"", "1.0", "seven", "+"});
            break;
        case value_type::date_time:
            values.push_back({"2024-01-15T10:20:30Z", k_ok, k_ok});
            values.push_back({"2024-01-15T10:20:30.25+01:00", k_ok, k_ok});
            // Intended: only reading demands a time zone.
            values.push_back({"2024-01-15T10:20:30", k_ok, qbxV2::EQBX_NO_PATTERN_MATCHED});
            add_malformed(values, {"", "2024-01-15", "yesterday", "2024-01-15 10:20:30Z"});
            break;
        case value_type::binary:
            values.push_back({"", k_ok, k_ok});
            values.push_back({"TWFu", k_ok, k_ok});
            values.push_back({"T W\nFu", k_ok, k_ok});
            add_malformed(values, {"T", "TW", "*abc"});
            break;
    }
    return values;
}

}  // namespace vrl_driver
