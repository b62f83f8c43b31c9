#include <gtest/gtest.h>

#include "tests/driver/any_object.h"
#include "tests/driver/element_surgery.h"
#include "tests/driver/facet_values.h"

namespace vrl_driver {
namespace {

/// A member and the class that declares it.
struct declared_member {
    const class_description* c;
    const member* m;
};

void PrintTo(const declared_member& d, std::ostream* os) { *os << d.c->name << "." << d.m->name; }

template <class Filter>
std::vector<declared_member> members_where(Filter filter) {
    std::vector<declared_member> found;
    for (const class_description& c : classes()) {
        for (const member& m : c.members) {
            if (filter(c, m)) found.push_back({&c, &m});
        }
    }
    return found;
}

std::string member_name(const testing::TestParamInfo<declared_member>& info) {
    return std::string(info.param.c->name) + "_" + info.param.m->name;
}

bool is_simple(const class_description&, const member& m) {
    return m.set != nullptr && m.kind != form::any_list;
}

bool is_option(const member& m) { return m.kind == form::value_option || m.kind == form::object_option; }

unsigned option_number(const declared_member& d) {
    unsigned number = 0;
    for (const member& m : d.c->members) {
        if (&m == d.m) break;
        if (is_option(m)) ++number;
    }
    return number;
}

/// An object in which the member is present, an option chosen.
any_object object_with(const declared_member& d, unsigned variant = 0) {
    return filled(*d.c, {is_option(*d.m) ? option_number(d) : variant, 1, 1});
}

/// The object's element with another text at the member's place.
std::string xml_with(const any_object& object, const member& m, const std::string& text) {
    element_surgery surgery(write(object).xml);
    if (m.kind == form::attribute) {
        surgery.set_attribute(m.name, text);
    } else if (m.kind == form::text) {
        surgery.set_text(text);
    } else {
        surgery.set_child_text(m.name, text);
    }
    return surgery.xml();
}

class EverySimpleMember : public testing::TestWithParam<declared_member> {
protected:
    const member& m() const { return *GetParam().m; }
    const class_description& c() const { return *GetParam().c; }
};

TEST_P(EverySimpleMember, SetterKeepsToTheFacets) {
    for (const facet_value& value : facet_values(m())) {
        if (value.setter < 0) continue;
        const any_object object = object_with(GetParam());
        const std::string before = contents(object);
        const bool list = m().size != nullptr;
        // Intended: lists take everything.
        const int expected = list ? qbxV2::EQBX_NO_ERROR : value.setter;
        EXPECT_EQ(m().set(object.get(), value.text), expected) << "'" << value.text << "'";
        if (expected != qbxV2::EQBX_NO_ERROR && !is_option(m())) {
            EXPECT_EQ(contents(object), before) << value.text;
        }
    }
}

TEST_P(EverySimpleMember, ReaderKeepsToTheFacets) {
    const any_object source = object_with(GetParam());
    for (const facet_value& value : facet_values(m())) {
        const any_object target(c());
        const std::string xml = xml_with(source, m(), value.text);
        EXPECT_EQ(read(target, xml), value.reader) << "'" << value.text << "' in " << xml;
    }
}

TEST_P(EverySimpleMember, GivesBackWhatWasSet) {
    for (unsigned variant = 0; variant < 6; ++variant) {
        const any_object object(c());
        const std::string text = legal_text(m(), variant);
        ASSERT_EQ(m().set(object.get(), text), qbxV2::EQBX_NO_ERROR) << text;
        EXPECT_EQ(m().get(object.get(), 0), text);
    }
}

INSTANTIATE_TEST_SUITE_P(Model, EverySimpleMember, testing::ValuesIn(members_where(is_simple)), member_name);

class EveryEnumeration : public testing::TestWithParam<declared_member> {};

TEST_P(EveryEnumeration, NumbersItsLiteralsInOrder) {
    const member& m = *GetParam().m;
    const any_object object(*GetParam().c);
    EXPECT_EQ(m.getenum(object.get()), m.get(object.get(), 0) == m.limits.literals[0] ? 1 : 0);
    int number = 0;
    for (const char* literal : m.limits.literals) {
        ++number;
        EXPECT_TRUE(m.setenum(object.get(), number));
        EXPECT_EQ(m.get(object.get(), 0), literal);
        EXPECT_EQ(m.getenum(object.get()), number);
    }
    for (const int outside : {0, -1, number + 1, 1000}) {
        EXPECT_FALSE(m.setenum(object.get(), outside)) << outside;
        EXPECT_EQ(m.getenum(object.get()), number);
    }
}

INSTANTIATE_TEST_SUITE_P(Model, EveryEnumeration,
                         testing::ValuesIn(members_where([](const class_description&, const member& m) {
                             return m.getenum != nullptr;
                         })),
                         member_name);

class EveryOptionalMember : public testing::TestWithParam<declared_member> {};

TEST_P(EveryOptionalMember, LosesItsPresenceAndKeepsItsValue) {
    const member& m = *GetParam().m;
    const any_object object = object_with(GetParam());
    ASSERT_TRUE(m.isset(object.get()));
    const std::string value = m.get != nullptr ? m.get(object.get(), 0) : std::string();
    m.unset(object.get());
    EXPECT_FALSE(m.isset(object.get()));
    if (m.get != nullptr) {
        EXPECT_EQ(m.get(object.get(), 0), value);
    }

    const written text = write(object);
    ASSERT_EQ(text.code, qbxV2::EQBX_NO_ERROR);
    const any_object back(*GetParam().c);
    const eqbx_error code = read(back, text.xml);
    if (m.kind == form::text) {
        // Intended: written without its text, and refused without it.
        EXPECT_EQ(code, qbxV2::EQBX_VALUE_BAD_FORMAT);
        return;
    }
    ASSERT_EQ(code, qbxV2::EQBX_NO_ERROR) << text.xml;
    EXPECT_EQ(m.isset(back.get()), m.always_written);
}

INSTANTIATE_TEST_SUITE_P(Model, EveryOptionalMember,
                         testing::ValuesIn(members_where([](const class_description&, const member& m) {
                             return m.isset != nullptr;
                         })),
                         member_name);

class EveryList : public testing::TestWithParam<declared_member> {};

TEST_P(EveryList, TakesAndLosesEntriesAtEveryPlace) {
    const member& m = *GetParam().m;
    const any_object object(*GetParam().c);
    void* const self = object.get();
    for (unsigned i = 0; i < 3; ++i) {
        if (m.make != nullptr) {
            void* const made = m.make(self);
            ASSERT_EQ(made, m.reach(self, i));
        } else {
            ASSERT_EQ(m.set(self, legal_text(m, i)), qbxV2::EQBX_NO_ERROR);
        }
    }
    EXPECT_EQ(m.size(self), 3U);
    m.erase(self, 1);
    EXPECT_EQ(m.size(self), 2U);
    m.erase(self, 99);
    EXPECT_EQ(m.size(self), 2U) << "there is no entry 99";
    if (m.insert != nullptr) {
        m.insert(self, 99, "<last/>");
        EXPECT_EQ(m.size(self), 3U);
        m.insert(self, 0, "<first/>");
        EXPECT_EQ(m.size(self), 4U);
    }
    if (m.reach != nullptr) {
        m.reach(self, 5);
        EXPECT_EQ(m.size(self), 6U) << "a mutable look past the end extends the list";
    }
    m.clear(self);
    EXPECT_EQ(m.size(self), 0U);
}

INSTANTIATE_TEST_SUITE_P(Model, EveryList,
                         testing::ValuesIn(members_where([](const class_description&, const member& m) {
                             // A date is no XML: lists of values take their own texts below.
                             return m.size != nullptr && m.value != value_type::date_time;
                         })),
                         member_name);

class EveryOption : public testing::TestWithParam<declared_member> {};

TEST_P(EveryOption, SwitchesTheChoiceAndRoundTrips) {
    const declared_member& d = GetParam();
    for (const member& other : d.c->members) {
        if (!is_option(other)) continue;
        const any_object object = object_with({d.c, &other});
        if (d.m->make != nullptr) {
            fill(find_class(d.m->class_name), d.m->make(object.get()), {});
        } else {
            ASSERT_EQ(d.m->set(object.get(), legal_text(*d.m, 1)), qbxV2::EQBX_NO_ERROR);
        }
        EXPECT_EQ(d.c->chosen(object.get()), static_cast<int>(option_number(d)));
        const written text = write(object);
        ASSERT_EQ(text.code, qbxV2::EQBX_NO_ERROR);
        const any_object back = object_with({d.c, &other});
        d.c->reset(back.get());
        ASSERT_EQ(read(back, text.xml), qbxV2::EQBX_NO_ERROR);
        EXPECT_EQ(contents(back), contents(object));
    }
}

INSTANTIATE_TEST_SUITE_P(Model, EveryOption,
                         testing::ValuesIn(members_where([](const class_description&, const member& m) {
                             return is_option(m);
                         })),
                         member_name);

}  // namespace
}  // namespace vrl_driver
