#include <gtest/gtest.h>

#include "tests/driver/any_object.h"
#include "tests/driver/element_surgery.h"

namespace vrl_driver {
namespace {

/// A class and one member, its own or inherited, that writing demands.
struct demanded_member {
    const class_description* c;
    const class_description* owner;
    const member* m;
};

void PrintTo(const demanded_member& d, std::ostream* os) { *os << d.c->name << "." << d.m->name; }

std::vector<demanded_member> demanded_members() {
    std::vector<demanded_member> found;
    for (const class_description& c : classes()) {
        if (c.kind == class_form::choice || c.kind == class_form::group) continue;
        const any_object object(c);
        for (const placed_member& at : members_of(c, object.get())) {
            if (at.m->required) found.push_back({&c, at.owner, at.m});
        }
    }
    return found;
}

std::string member_name(const testing::TestParamInfo<demanded_member>& info) {
    return std::string(info.param.c->name) + "_" + info.param.m->name;
}

bool is_choice_or_group(const member& m) {
    if (m.class_name == nullptr) return false;
    const class_form kind = find_class(m.class_name).kind;
    return kind == class_form::choice || kind == class_form::group;
}

class EveryRequiredMember : public testing::TestWithParam<demanded_member> {
protected:
    const class_description& c() const { return *GetParam().c; }
    const member& m() const { return *GetParam().m; }

    /// Everything legal but the one member.
    any_object filled_but_for_it() const {
        any_object object(c());
        for (const placed_member& at : members_of(c(), object.get())) {
            if (at.m == &m()) continue;
            if (at.m->make != nullptr) {
                fill(find_class(at.m->class_name), at.m->make(at.self), {0, 0, 1});
            } else if (at.m->kind == form::any_list) {
                at.m->set(at.self, "<note/>");
            } else {
                at.m->set(at.self, legal_text(*at.m, 0));
            }
        }
        return object;
    }
};

TEST_P(EveryRequiredMember, IsDemandedOnWriting) {
    // The root's preamble is present from birth.
    if (c().kind == class_form::root) return;
    const any_object object = filled_but_for_it();
    EXPECT_EQ(c().is_occurs_ok(object.get()), !m().has_presence);
    const written text = write(object);
    EXPECT_EQ(text.code, qbxV2::EQBX_OCCURS_ERROR_ON_MARSHAL);
    EXPECT_EQ(text.xml.empty(), m().has_presence) << "nothing of the element is written";
}

TEST_P(EveryRequiredMember, IsMissedOnReading) {
    const any_object whole = filled(c(), {0, 1, 1});
    element_surgery surgery(write(whole).xml);
    int expected = qbxV2::EQBX_MANDATORY_ELEMENT_MISSING;
    if (m().kind == form::attribute) {
        surgery.remove_attribute(m().name);
        expected = qbxV2::EQBX_REQUIRED_ATTRIBUTE_MISSING;
    } else if (m().kind == form::text) {
        surgery.remove_content();
        const bool enumerated = !m().limits.literals.empty();
        expected = enumerated                        ? qbxV2::EQBX_VALUE_NOT_ENUMERATED
                   : m().value == value_type::text   ? qbxV2::EQBX_NO_ERROR
                   : m().value == value_type::binary ? qbxV2::EQBX_NO_ERROR
                                                     : qbxV2::EQBX_VALUE_BAD_FORMAT;
    } else if (m().kind == form::group || m().kind == form::group_list) {
        for (const group_member& option : find_class(m().class_name).group) {
            surgery.remove_children(option.element);
        }
    } else {
        surgery.remove_children(m().name);
    }
    // Intended: where emptiness is accepted, nobody asks for what is missing.
    if (!surgery.has_elements() && c().accepts_empty) expected = qbxV2::EQBX_NO_ERROR;
    if (m().read_optional) expected = qbxV2::EQBX_NO_ERROR;
    if (m().kind == form::any_list) {
        // Intended: an empty element is accepted, one with content but no element is not.
        surgery.set_text("text");
    }
    const any_object target(c());
    EXPECT_EQ(read(target, surgery.xml()), expected) << surgery.xml();
}

TEST_P(EveryRequiredMember, MustHaveChosenWhereItIsAChoice) {
    if (!is_choice_or_group(m()) || m().size != nullptr) return;
    const any_object object = filled_but_for_it();
    for (const placed_member& at : members_of(c(), object.get())) {
        if (at.m == &m()) at.m->make(at.self);
    }
    EXPECT_FALSE(c().is_occurs_ok(object.get()));
    EXPECT_EQ(write(object).code, qbxV2::EQBX_OCCURS_ERROR_ON_MARSHAL);
}

INSTANTIATE_TEST_SUITE_P(Model, EveryRequiredMember, testing::ValuesIn(demanded_members()), member_name);

}  // namespace
}  // namespace vrl_driver
