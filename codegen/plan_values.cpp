#include "codegen/plan_values.h"

#include <regex>
#include <set>

#include "codegen/plan_names.h"
#include "codegen/xml_dom.h"

namespace vrl_codegen {
namespace {

struct stored_form {
    value_kind kind;
    const char* type;
    const char* parameter;
    limits_plan::form limits;  ///< that the frame can check of such a value, beside a text's own
    bool collapsed_text;
    const char* lowest;
    const char* highest;
};

/// Stored forms of the XML Schema built-ins that the format uses. Bounds of a whole number without facets are
/// those that reading admits.
const std::map<std::string, stored_form>& stored_forms() {
    using form = limits_plan::form;
    static const std::map<std::string, stored_form> forms = {
        {"double", {value_kind::number, "double", "double", form::range, false, "", ""}},
        {"string", {value_kind::text, "std::wstring", "std::wstring const&", form::length, false, "", ""}},
        {"token", {value_kind::text, "std::wstring", "std::wstring const&", form::length, true, "", ""}},
        {"anyURI", {value_kind::text, "std::wstring", "std::wstring const&", form::length, true, "", ""}},
        {"boolean", {value_kind::boolean, "bool", "bool", form::none, false, "", ""}},
        {"int", {value_kind::integer, "int", "int", form::whole, false, "-2147483648", "2147483647"}},
        {"unsignedInt",
         {value_kind::unsigned_integer, "unsigned int", "unsigned int", form::whole, false, "0",
          "2147483647"}},
        {"unsignedByte",
         {value_kind::byte, "unsigned char", "unsigned char", form::whole, false, "0", "255"}},
        {"dateTime",
         {value_kind::date_time, "qbxV2::c_datetime", "qbxV2::c_datetime const&", form::none, false, "", ""}},
        {"base64Binary",
         {value_kind::binary, "qbxV2::c_binary", "qbxV2::c_binary const&", form::none, false, "", ""}},
    };
    return forms;
}

/// A number as C++ and the schema both write it: no leading zeros, no "INF".
bool is_plain_number(const std::string& text) {
    static const std::regex form("-?(0|[1-9][0-9]*)(\\.[0-9]+)?([eE][+-]?[0-9]+)?");
    return std::regex_match(text, form);
}

bool is_plain_whole(const std::string& text) {
    static const std::regex form("0|-?[1-9][0-9]*");
    return std::regex_match(text, form);
}

/// The facets that stay unchecked when the frame checks `form`, as a type without them.
facets unchecked(const value_plan& value, limits_plan::form form) {
    facets left = value.facet;
    if (form == limits_plan::form::range || form == limits_plan::form::whole) {
        left.min_inclusive.reset();
        left.max_inclusive.reset();
    }
    if (form == limits_plan::form::range) {
        left.min_exclusive.reset();
        left.max_exclusive.reset();
    }
    if (form == limits_plan::form::length) {
        left.min_length.reset();
        left.max_length.reset();
    }
    if (form == limits_plan::form::literals) left.enumeration.clear();
    // The one pattern that there is says that a time has a zone, which its class checks by itself.
    if (value.kind == value_kind::date_time) left.has_pattern = false;
    return left;
}

void check_bounds(const value_plan& value, const std::string& place) {
    const facets& facet = value.facet;
    const bool number = value.kind == value_kind::number;
    for (const auto* bound :
         {&facet.min_inclusive, &facet.min_exclusive, &facet.max_inclusive, &facet.max_exclusive}) {
        if (!*bound || (number ? is_plain_number(**bound) : is_plain_whole(**bound))) continue;
        throw schema_error(place, "a bound has to be a plain number, not " + **bound);
    }
}

std::string limits_name(const simple_type& type, limits_plan::form form, const std::string& owner,
                        const std::string& member) {
    if (!type.name.empty()) return "k_" + identifier(type.name);
    const bool plain = type.limits == facets();
    // Types without facets of which every value shares one constant.
    if (plain && (type.built_in == "int" || form == limits_plan::form::none)) return "k_" + type.built_in;
    return "k_" + identifier(owner) + "_" + identifier(member);
}

/// What the frame checks of a value.
limits_plan plan_limits(const value_plan& value, const stored_form& form) {
    limits_plan limits;
    limits.facet = value.facet;
    limits.collapsed = form.collapsed_text;
    if (form.limits == limits_plan::form::whole) {
        limits.kind = form.limits;
        limits.lowest = value.facet.min_inclusive.value_or(form.lowest);
        limits.highest = value.facet.max_inclusive.value_or(form.highest);
    } else if (value.is_enumerated() && !form.collapsed_text) {
        limits.kind = limits_plan::form::literals;
    } else if (form.limits == limits_plan::form::range ? value.facet.has_range() : value.facet.has_length()) {
        limits.kind = form.limits;
    }
    return limits;
}

}  // namespace

value_plan value_planner::plan_value(const simple_type& type, const std::string& owner,
                                     const std::string& member, const std::string& place) {
    const auto found = stored_forms().find(type.built_in);
    if (found == stored_forms().end()) {
        throw schema_error(place, "no stored form for a value of xs:" + type.built_in);
    }
    const stored_form& form = found->second;
    value_plan value;
    value.kind = form.kind;
    value.type = form.type;
    value.parameter = form.parameter;
    value.facet = type.limits;
    check_bounds(value, place);
    limits_plan limits = plan_limits(value, form);
    if (unchecked(value, limits.kind) != facets()) {
        throw schema_error(place, "nothing checks these facets of xs:" + type.built_in);
    }
    const bool unlimited = limits.kind == limits_plan::form::none && !limits.collapsed;
    limits.name = unlimited ? "k_any" : limits_name(type, limits.kind, owner, member);
    if (unlimited) limits.facet = facets();
    value.limits = limits.name;
    const auto [known, added] = m_limits.emplace(limits.name, limits);
    if (known->second != limits) throw schema_error(place, "two meanings for the facets " + limits.name);
    return value;
}

std::vector<limits_plan> value_planner::limits_of(const class_plan& owner) const {
    std::vector<limits_plan> used;
    std::set<std::string> seen;
    for (const member_plan& member : owner.members) {
        const auto limits = m_limits.find(member.value.limits);
        if (limits != m_limits.end() && seen.insert(limits->first).second) used.push_back(limits->second);
    }
    return used;
}

void check_initial(const value_plan& value, const std::string& text, const std::string& place) {
    bool fits = false;
    switch (value.kind) {
        case value_kind::number:
            fits = is_plain_number(text);
            break;
        case value_kind::integer:
        case value_kind::unsigned_integer:
        case value_kind::byte:
            fits = is_plain_whole(text);
            break;
        case value_kind::boolean:
            fits = text == "true" || text == "false";
            break;
        case value_kind::text:
            fits = true;
            break;
        case value_kind::date_time:
        case value_kind::binary:
            break;
    }
    if (!fits) throw schema_error(place, "no value of " + value.type + " starts as '" + text + "'");
}

}  // namespace vrl_codegen
