#include "codegen/plan_members.h"

#include <set>

#include "codegen/xml_dom.h"

namespace vrl_codegen {
namespace {

struct stored_form {
    value_kind kind;
    const char* type;
    const char* parameter;
    bool collapsed_text;
};

/// Stored forms of the XML Schema built-ins that the format uses.
const std::map<std::string, stored_form>& stored_forms() {
    static const std::map<std::string, stored_form> forms = {
        {"double", {value_kind::number, "double", "double", false}},
        {"string", {value_kind::text, "std::wstring", "std::wstring const&", false}},
        {"token", {value_kind::text, "std::wstring", "std::wstring const&", true}},
        {"anyURI", {value_kind::text, "std::wstring", "std::wstring const&", true}},
        {"boolean", {value_kind::boolean, "bool", "bool", false}},
        {"int", {value_kind::integer, "int", "int", false}},
        {"unsignedInt", {value_kind::unsigned_integer, "unsigned int", "unsigned int", false}},
        {"unsignedByte", {value_kind::byte, "unsigned char", "unsigned char", false}},
        {"dateTime", {value_kind::date_time, "qbxV2::c_datetime", "qbxV2::c_datetime const&", false}},
        {"base64Binary", {value_kind::binary, "qbxV2::c_binary", "qbxV2::c_binary const&", false}},
    };
    return forms;
}

std::string wide_literals(const std::vector<std::string>& texts) {
    std::string list;
    for (const std::string& text : texts) list += (list.empty() ? "" : ", ") + ("L\"" + text + "\"");
    return list;
}

std::string range_definition(const facets& limits) {
    std::string built = "frame::range()";
    if (limits.min_inclusive) built += ".from(" + *limits.min_inclusive + ")";
    if (limits.min_exclusive) built += ".above(" + *limits.min_exclusive + ")";
    if (limits.max_inclusive) built += ".to(" + *limits.max_inclusive + ")";
    if (limits.max_exclusive) built += ".below(" + *limits.max_exclusive + ")";
    return built;
}

std::string length_definition(const facets& limits) {
    std::string built = std::to_string(limits.min_length.value_or(0));
    if (limits.max_length) built += ", " + std::to_string(*limits.max_length);
    return built;
}

/// Bounds of a whole number: its facets, else those of the stored type on reading.
std::string whole_definition(value_kind kind, const facets& limits) {
    const char* low = kind == value_kind::integer ? "-2147483648" : "0";
    const char* high = kind == value_kind::byte ? "255" : "2147483647";
    return "\"" + limits.min_inclusive.value_or(low) + "\", \"" + limits.max_inclusive.value_or(high) + "\"";
}

}  // namespace

std::string identifier(const std::string& text) {
    std::string name;
    for (const char c : text) {
        const bool letter = (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z') || (c >= '0' && c <= '9');
        name.push_back(letter ? c : '_');
    }
    return name;
}

value_plan value_planner::plan_value(const simple_type& type, const std::string& owner,
                                     const std::string& member) {
    const auto form = stored_forms().find(type.built_in);
    if (form == stored_forms().end()) {
        throw schema_error(owner + "." + member + ": no stored form for xs:" + type.built_in);
    }
    value_plan value;
    value.kind = form->second.kind;
    value.type = form->second.type;
    value.parameter = form->second.parameter;
    value.facet = type.limits;

    const std::string name = limits_name(type, owner, member);
    limits_plan limits{name, std::string()};
    const bool whole = value.kind == value_kind::integer || value.kind == value_kind::unsigned_integer ||
                       value.kind == value_kind::byte;
    std::string wrapped = "frame::no_limits";
    if (whole) {
        limits.definition =
            "constexpr frame::whole " + name + "{" + whole_definition(value.kind, type.limits) + "};";
    } else if (value.kind == value_kind::number && type.limits.has_range()) {
        limits.definition = "constexpr frame::range " + name + " = " + range_definition(type.limits) + ";";
    } else if (!type.limits.enumeration.empty()) {
        limits.definition = "constexpr std::wstring_view " + name + "_texts[] = {" +
                            wide_literals(type.limits.enumeration) + "};\nconstexpr frame::literals " + name +
                            "(" + name + "_texts);";
    } else if (value.kind == value_kind::text && (type.limits.min_length || type.limits.max_length)) {
        wrapped = "frame::length";
        limits.definition = "constexpr frame::length " + name + "{" + length_definition(type.limits) + "};";
    }
    if (form->second.collapsed_text) {
        const std::string inner =
            limits.definition.empty() ? "{}" : "{{" + length_definition(type.limits) + "}}";
        limits.definition = "constexpr frame::collapsed<" + wrapped + "> " + name + inner + ";";
    }
    if (limits.definition.empty()) {
        value.limits = "k_any";
        m_limits["k_any"] = {"k_any", "constexpr frame::no_limits k_any;"};
        return value;
    }
    const auto [known, added] = m_limits.emplace(name, limits);
    if (!added && known->second.definition != limits.definition) {
        throw schema_error(owner + "." + member + ": two meanings for the facets " + name);
    }
    value.limits = name;
    return value;
}

std::string value_planner::limits_name(const simple_type& type, const std::string& owner,
                                       const std::string& member) {
    if (!type.name.empty()) return "k_" + identifier(type.name);
    if (type.built_in == "int" || type.built_in == "token" || type.built_in == "anyURI") {
        const bool plain = !type.limits.min_length && !type.limits.max_length && !type.limits.has_range();
        if (plain) return "k_" + type.built_in;
    }
    return "k_" + identifier(owner) + "_" + identifier(member);
}

std::string value_planner::initial_value(const value_plan& value, const std::string& text) {
    if (value.kind == value_kind::text) return "L\"" + text + "\"";
    return text;
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

void plan_positions(class_plan& owner) {
    std::vector<member_plan*> children;
    for (member_plan& member : owner.members) {
        if (member.kind != member_kind::attribute && member.kind != member_kind::text) {
            children.push_back(&member);
        }
    }
    const auto repeats = [](const member_plan& member) {
        return member.kind == member_kind::value_list || member.kind == member_kind::object_list ||
               member.kind == member_kind::group_list || member.kind == member_kind::any_list;
    };
    const auto count = static_cast<unsigned>(children.size());
    const auto reach = [&](unsigned first, unsigned from) {
        row_range names{first, from};
        while (names.last < count) {
            const member_plan& member = *children[names.last++];
            if (member.required && !member.read_optional) break;
        }
        return names;
    };
    for (unsigned i = 0; i < count; ++i) {
        if (owner.kind == class_kind::choice) {
            children[i]->next = {0, count};
        } else {
            children[i]->next = reach(repeats(*children[i]) ? i : i + 1, i + 1);
        }
    }
    owner.first_names = owner.kind == class_kind::choice ? row_range{0, count} : reach(0, 0);
}

}  // namespace vrl_codegen
