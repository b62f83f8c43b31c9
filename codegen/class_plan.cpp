#include "codegen/class_plan.h"

#include <algorithm>

namespace vrl_codegen {
namespace {

template <class Holds>
std::vector<const member_plan*> those_of(const std::vector<member_plan>& members, Holds holds) {
    std::vector<const member_plan*> found;
    for (const member_plan& member : members) {
        if (holds(member)) found.push_back(&member);
    }
    return found;
}

}  // namespace

bool member_plan::is_list() const {
    return kind == member_kind::value_list || kind == member_kind::object_list ||
           kind == member_kind::group_list || kind == member_kind::any_list;
}

bool member_plan::has_presence_accessors() const {
    const bool option = kind == member_kind::value_option || kind == member_kind::object_option;
    return !is_list() && !option && !required && has_presence;
}

std::vector<const member_plan*> class_plan::attributes() const {
    return those_of(members, [](const member_plan& m) { return m.kind == member_kind::attribute; });
}

std::vector<const member_plan*> class_plan::required_attributes() const {
    return those_of(members,
                    [](const member_plan& m) { return m.kind == member_kind::attribute && m.required; });
}

std::vector<const member_plan*> class_plan::children() const {
    return those_of(members, [](const member_plan& m) { return m.is_child(); });
}

const member_plan* class_plan::text() const {
    const auto found = those_of(members, [](const member_plan& m) { return m.kind == member_kind::text; });
    return found.empty() ? nullptr : found.front();
}

bool class_plan::has_initial_values() const {
    return std::any_of(members.begin(), members.end(),
                       [](const member_plan& member) { return !member.initial.empty(); });
}

const class_plan* plan::find(const std::string& name) const {
    const auto found = std::find_if(classes.begin(), classes.end(),
                                    [&name](const class_plan& made) { return made.name == name; });
    return found == classes.end() ? nullptr : &*found;
}

}  // namespace vrl_codegen
