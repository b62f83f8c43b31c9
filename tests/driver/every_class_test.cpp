#include <gtest/gtest.h>

#include "tests/driver/any_object.h"

namespace vrl_driver {

void PrintTo(const class_description* c, std::ostream* os) { *os << c->name; }

namespace {

std::vector<const class_description*> all_classes() {
    std::vector<const class_description*> all;
    for (const class_description& c : classes()) all.push_back(&c);
    return all;
}

std::string class_name(const testing::TestParamInfo<const class_description*>& info) {
    return info.param->name;
}

/// As many variants as there are literals, options or members to go round, within reason.
constexpr unsigned k_variants = 6;

class EveryClass : public testing::TestWithParam<const class_description*> {
protected:
    const class_description& kind() const { return *GetParam(); }
    bool is_group() const { return kind().kind == class_form::group; }
};

TEST_P(EveryClass, HasNothingPresentWhenNew) {
    const any_object object(kind());
    for (const placed_member& at : members_of(kind(), object.get())) {
        EXPECT_FALSE(at.m->isset != nullptr && at.m->isset(at.self)) << at.m->name;
        EXPECT_FALSE(at.m->size != nullptr && at.m->size(at.self) != 0) << at.m->name;
    }
    if (kind().chosen != nullptr) {
        EXPECT_EQ(kind().chosen(object.get()), kind().none_state);
    }
    EXPECT_FALSE(kind().is_nil != nullptr && kind().is_nil(object.get()));
}

TEST_P(EveryClass, RoundTripsByteForByte) {
    if (is_group()) return;  // written and read inside of what holds it: see EveryGroup
    for (unsigned variant = 0; variant < k_variants; ++variant) {
        const any_object object = filled(kind(), {variant, 2, 2});
        const written first = write(object);
        ASSERT_EQ(first.code, qbxV2::EQBX_NO_ERROR) << variant;
        const any_object back(kind());
        ASSERT_EQ(read(back, first.xml), qbxV2::EQBX_NO_ERROR) << first.xml;
        EXPECT_EQ(contents(back), contents(object));
        const written second = write(back);
        EXPECT_EQ(second.code, qbxV2::EQBX_NO_ERROR);
        EXPECT_EQ(second.xml, first.xml);
    }
}

TEST_P(EveryClass, RoundTripsWithRequiredMembersAlone) {
    if (is_group()) return;
    const any_object object = filled(kind(), {1, 0, 1});
    EXPECT_TRUE(kind().is_occurs_ok(object.get()));
    const written text = write(object);
    ASSERT_EQ(text.code, qbxV2::EQBX_NO_ERROR);
    const any_object back(kind());
    ASSERT_EQ(read(back, text.xml), qbxV2::EQBX_NO_ERROR) << text.xml;
    EXPECT_EQ(contents(back), contents(object));
}

TEST_P(EveryClass, CopiesWholeAndDeep) {
    const any_object object = filled(kind(), {2, 2, 2});
    const std::string before = contents(object);
    const any_object copy = object.copy();
    EXPECT_EQ(contents(copy), before);
    kind().reset(object.get());
    EXPECT_EQ(contents(copy), before);
}

TEST_P(EveryClass, AssignsOverWhatWasThere) {
    const any_object source = filled(kind(), {1, 1, 2});
    const any_object target = filled(kind(), {3, 2, 3});
    kind().assign(target.get(), source.get());
    EXPECT_EQ(contents(target), contents(source));
    kind().assign(target.get(), target.get());
    EXPECT_EQ(contents(target), contents(source));
}

TEST_P(EveryClass, SwapsEverything) {
    const any_object a = filled(kind(), {0, 2, 1});
    const any_object b = filled(kind(), {3, 1, 3});
    const std::string was_a = contents(a);
    const std::string was_b = contents(b);
    kind().swap(a.get(), b.get());
    EXPECT_EQ(contents(a), was_b);
    EXPECT_EQ(contents(b), was_a);
    kind().swap(a.get(), a.get());
    EXPECT_EQ(contents(a), was_b);
}

TEST_P(EveryClass, EqualsANewObjectAfterReset) {
    const any_object object = filled(kind(), {2, 2, 2});
    kind().reset(object.get());
    EXPECT_EQ(contents(object), contents(any_object(kind())));
}

TEST_P(EveryClass, KeepsTheNilFlagThroughCopyWriteAndRead) {
    if (kind().set_nil == nullptr) return;
    const any_object object(kind());
    kind().set_nil(object.get());
    EXPECT_TRUE(kind().is_occurs_ok(object.get()));
    EXPECT_TRUE(kind().is_nil(object.copy().get()));
    const written text = write(object);
    ASSERT_EQ(text.code, qbxV2::EQBX_NO_ERROR);
    EXPECT_NE(text.xml.find(" xsi:nil=\"true\"/>\n"), std::string::npos) << text.xml;
    const any_object back(kind());
    EXPECT_EQ(read(back, text.xml), qbxV2::EQBX_NO_ERROR);
    EXPECT_TRUE(kind().is_nil(back.get()));
}

TEST_P(EveryClass, TellsItsIdentity) {
    if (!kind().polymorphic) return;
    const any_object object = filled(kind(), {0, 1, 1});
    EXPECT_EQ(kind().getid(object.get()), kind().static_id());
    EXPECT_TRUE(kind().has_id(object.get(), kind().static_id()));
    if (kind().base != nullptr) {
        EXPECT_TRUE(kind().has_id(object.get(), find_class(kind().base).static_id()));
    }
    const std::string same_text = kind().static_id();
    EXPECT_FALSE(kind().has_id(object.get(), same_text.c_str()));

    // An element class makes clones of its type class.
    const class_description& made = kind().kind == class_form::element ? find_class(kind().base) : kind();
    const any_object clone(made, kind().clone(object.get()));
    EXPECT_EQ(
        contents(clone),
        contents(made, kind().kind == class_form::element ? kind().to_base(object.get()) : object.get()));
}

TEST_P(EveryClass, MakesItsFamilyByName) {
    if (kind().made_by_factory == nullptr) return;
    const char* id = nullptr;
    for (const char* name : kind().factory) {
        ASSERT_NE(kind().made_by_factory(1000, name, &id), nullptr) << name;
        EXPECT_STREQ(id, name);
        EXPECT_EQ(kind().made_by_factory(1, name, &id), nullptr) << name;
    }
    EXPECT_EQ(kind().made_by_factory(1000, kind().name, &id), nullptr) << "the head itself is not made";
    EXPECT_EQ(kind().made_by_factory(1000, "Nonsense", &id), nullptr);
}

TEST_P(EveryClass, WritesAndReadsDocumentsOfItsOwn) {
    if (!kind().standalone) return;
    const any_object object = filled(kind(), {0, 2, 1});
    std::string text = "left alone on failure";
    ASSERT_EQ(kind().marshal_string(object.get(), &text), qbxV2::EQBX_NO_ERROR);
    EXPECT_EQ(text.find("<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n<Vrl:"), 0U);
    const any_object back(kind());
    ASSERT_EQ(kind().unmarshal_string(back.get(), text), qbxV2::EQBX_NO_ERROR);
    EXPECT_EQ(contents(back), contents(object));
}

INSTANTIATE_TEST_SUITE_P(Model, EveryClass, testing::ValuesIn(all_classes()), class_name);

}  // namespace
}  // namespace vrl_driver
