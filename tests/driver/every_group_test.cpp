#include <gtest/gtest.h>

#include "tests/driver/any_object.h"

namespace vrl_driver {
namespace {

/// A substitution group, and a class with a member that holds it.
struct group_place {
    const class_description* group;
    const class_description* holder;
    const member* place;
};

void PrintTo(const group_place& g, std::ostream* os) { *os << g.holder->name << "." << g.place->name; }

std::vector<group_place> places() {
    std::vector<group_place> found;
    for (const class_description& c : classes()) {
        for (const member& m : c.members) {
            if (m.kind != form::group && m.kind != form::group_list) continue;
            found.push_back({&find_class(m.class_name), &c, &m});
        }
    }
    return found;
}

std::string place_name(const testing::TestParamInfo<group_place>& info) {
    return std::string(info.param.holder->name) + "_" + info.param.place->name;
}

class EveryGroup : public testing::TestWithParam<group_place> {};

TEST_P(EveryGroup, HoldsEachMemberUnderItsOwnElement) {
    const group_place& at = GetParam();
    for (std::size_t i = 0; i < at.group->group.size(); ++i) {
        const group_member& option = at.group->group[i];
        if (option.is_head) continue;
        const any_object object = filled(*at.holder, {0, 0, 1});
        if (at.place->clear != nullptr) at.place->clear(object.get());
        void* const group = at.place->make(object.get());
        fill(find_class(option.class_name), option.make(group), {0, 1, 1});
        EXPECT_EQ(at.group->chosen(group), static_cast<int>(i));

        const written text = write(object);
        ASSERT_EQ(text.code, qbxV2::EQBX_NO_ERROR) << option.element;
        EXPECT_NE(text.xml.find(std::string("<Vrl:") + option.element), std::string::npos) << text.xml;
        EXPECT_EQ(text.xml.find("xsi:type"), std::string::npos) << text.xml;
        const any_object back(*at.holder);
        ASSERT_EQ(read(back, text.xml), qbxV2::EQBX_NO_ERROR) << text.xml;
        EXPECT_EQ(contents(back), contents(object));
        EXPECT_EQ(contents(object.copy()), contents(object));
    }
}

TEST_P(EveryGroup, IsRefusedOnWritingWithoutAMember) {
    const group_place& at = GetParam();
    const any_object object = filled(*at.holder, {0, 0, 1});
    at.group->reset(at.place->make(object.get()));
    EXPECT_EQ(write(object).code, qbxV2::EQBX_OCCURS_ERROR_ON_MARSHAL);
}

INSTANTIATE_TEST_SUITE_P(Model, EveryGroup, testing::ValuesIn(places()), place_name);

}  // namespace
}  // namespace vrl_driver
