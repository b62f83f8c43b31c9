#include "codegen/plan_values.h"

#include <gtest/gtest.h>

#include <ostream>
#include <string>

#include "codegen/xml_dom.h"

namespace {

using vrl_codegen::check_initial;
using vrl_codegen::class_plan;
using vrl_codegen::facets;
using vrl_codegen::limits_plan;
using vrl_codegen::member_plan;
using vrl_codegen::schema_error;
using vrl_codegen::simple_type;
using vrl_codegen::value_kind;
using vrl_codegen::value_plan;
using vrl_codegen::value_planner;
using form = limits_plan::form;

simple_type of(const std::string& built_in, const facets& limits = {}, const std::string& name = {}) {
    simple_type type;
    type.built_in = built_in;
    type.limits = limits;
    type.name = name;
    return type;
}

limits_plan limits_of(value_planner& planner, const value_plan& value) {
    class_plan owner;
    owner.members.emplace_back();
    owner.members.back().value = value;
    return planner.limits_of(owner).at(0);
}

facets low(const char* bound) {
    facets made;
    made.min_inclusive = bound;
    return made;
}

facets above(const char* bound) {
    facets made;
    made.min_exclusive = bound;
    return made;
}

facets longest(unsigned length) {
    facets made;
    made.max_length = length;
    return made;
}

facets literals() {
    facets made;
    made.enumeration = {"a", "b"};
    return made;
}

facets pattern() {
    facets made;
    made.has_pattern = true;
    return made;
}

struct value_case {
    const char* why;
    simple_type type;
    value_kind kind;
    const char* stored;
    const char* passed;
    const char* limits;
    form limits_form;
    bool collapsed;
};

void PrintTo(const value_case& c, std::ostream* os) { *os << c.why; }

class PlanValue : public testing::TestWithParam<value_case> {};

TEST_P(PlanValue, HasAStoredFormAndLimits) {
    const value_case& c = GetParam();
    value_planner planner;
    const value_plan value = planner.plan_value(c.type, "Owner", "Member", "small.xsd:1");
    EXPECT_EQ(value.kind, c.kind);
    EXPECT_EQ(value.type, c.stored);
    EXPECT_EQ(value.parameter, c.passed);
    EXPECT_EQ(value.limits, c.limits);
    const limits_plan limits = limits_of(planner, value);
    EXPECT_EQ(limits.kind, c.limits_form);
    EXPECT_EQ(limits.collapsed, c.collapsed);
}

const char* const k_wide = "std::wstring";
const char* const k_wide_in = "std::wstring const&";

const value_case k_values[] = {
    {"a number", of("double"), value_kind::number, "double", "double", "k_any", form::none, false},
    {"a number with a bound", of("double", low("0.5")), value_kind::number, "double", "double",
     "k_Owner_Member", form::range, false},
    {"a number of a named type", of("double", above("0"), "Positive"), value_kind::number, "double", "double",
     "k_Positive", form::range, false},
    {"a named type without facets", of("double", {}, "Anything"), value_kind::number, "double", "double",
     "k_any", form::none, false},
    {"a text", of("string"), value_kind::text, k_wide, k_wide_in, "k_any", form::none, false},
    {"a text with a length", of("string", longest(4)), value_kind::text, k_wide, k_wide_in, "k_Owner_Member",
     form::length, false},
    {"an enumerated text", of("string", literals(), "Some-Kind"), value_kind::text, k_wide, k_wide_in,
     "k_Some_Kind", form::literals, false},
    {"a collapsed text", of("token"), value_kind::text, k_wide, k_wide_in, "k_token", form::none, true},
    {"a collapsed text with a length", of("token", longest(4)), value_kind::text, k_wide, k_wide_in,
     "k_Owner_Member", form::length, true},
    {"a URI", of("anyURI"), value_kind::text, k_wide, k_wide_in, "k_anyURI", form::none, true},
    {"a truth value", of("boolean"), value_kind::boolean, "bool", "bool", "k_any", form::none, false},
    {"a whole number", of("int"), value_kind::integer, "int", "int", "k_int", form::whole, false},
    {"a whole number with a bound", of("int", low("-1")), value_kind::integer, "int", "int", "k_Owner_Member",
     form::whole, false},
    {"an unsigned number", of("unsignedInt", {}, "Count"), value_kind::unsigned_integer, "unsigned int",
     "unsigned int", "k_Count", form::whole, false},
    {"a byte", of("unsignedByte"), value_kind::byte, "unsigned char", "unsigned char", "k_Owner_Member",
     form::whole, false},
    {"a time, whose class checks its zone", of("dateTime", pattern(), "Zoned"), value_kind::date_time,
     "qbxV2::c_datetime", "qbxV2::c_datetime const&", "k_any", form::none, false},
    {"bytes", of("base64Binary"), value_kind::binary, "qbxV2::c_binary", "qbxV2::c_binary const&", "k_any",
     form::none, false},
};
INSTANTIATE_TEST_SUITE_P(Types, PlanValue, testing::ValuesIn(k_values));

struct bounds_case {
    simple_type type;
    const char* lowest;
    const char* highest;
};

void PrintTo(const bounds_case& c, std::ostream* os) { *os << c.type.built_in; }

class PlanWhole : public testing::TestWithParam<bounds_case> {};

TEST_P(PlanWhole, HasBoundsOfItsFacetsElseOfReading) {
    value_planner planner;
    const limits_plan limits = limits_of(planner, planner.plan_value(GetParam().type, "Owner", "Member", ""));
    EXPECT_EQ(limits.lowest, GetParam().lowest);
    EXPECT_EQ(limits.highest, GetParam().highest);
}

facets between(const char* lowest, const char* highest) {
    facets made = low(lowest);
    made.max_inclusive = highest;
    return made;
}

const bounds_case k_bounds[] = {
    {of("int"), "-2147483648", "2147483647"}, {of("unsignedInt"), "0", "2147483647"},
    {of("unsignedByte"), "0", "255"},         {of("int", low("-5")), "-5", "2147483647"},
    {of("int", between("0", "9")), "0", "9"},
};
INSTANTIATE_TEST_SUITE_P(Types, PlanWhole, testing::ValuesIn(k_bounds));

struct refused_case {
    const char* why;
    simple_type type;
    const char* said;
};

void PrintTo(const refused_case& c, std::ostream* os) { *os << c.why; }

class RefusedValue : public testing::TestWithParam<refused_case> {};

TEST_P(RefusedValue, IsToldByPlaceAndReason) {
    value_planner planner;
    try {
        planner.plan_value(GetParam().type, "Owner", "Member", "small.xsd:7");
        FAIL();
    } catch (const schema_error& refused) {
        EXPECT_EQ(refused.what(), std::string("small.xsd:7: ") + GetParam().said);
    }
}

facets literals_with_length() {
    facets made = literals();
    made.max_length = 4;
    return made;
}

const refused_case k_refused[] = {
    {"a type that nothing stores", of("float"), "no stored form for a value of xs:float"},
    {"a pattern of a text", of("string", pattern()), "nothing checks these facets of xs:string"},
    {"literals of a collapsed text", of("token", literals()), "nothing checks these facets of xs:token"},
    {"literals with a length", of("string", literals_with_length()),
     "nothing checks these facets of xs:string"},
    {"literals of a whole number", of("int", literals()), "nothing checks these facets of xs:int"},
    {"an open bound of a whole number", of("int", above("0")), "nothing checks these facets of xs:int"},
    {"a bound of a time", of("dateTime", low("2020")), "nothing checks these facets of xs:dateTime"},
    {"a length of bytes", of("base64Binary", longest(4)), "nothing checks these facets of xs:base64Binary"},
    {"an infinite bound", of("double", low("-INF")), "a bound has to be a plain number, not -INF"},
    {"a bound that C++ would read as octal", of("double", low("010")),
     "a bound has to be a plain number, not 010"},
    {"a whole bound with a sign", of("int", low("+5")), "a bound has to be a plain number, not +5"},
    {"a whole bound with zeros", of("int", low("007")), "a bound has to be a plain number, not 007"},
};
INSTANTIATE_TEST_SUITE_P(Values, RefusedValue, testing::ValuesIn(k_refused));

TEST(PlanValues, OneTypeIsOneConstant) {
    value_planner planner;
    const simple_type type = of("double", low("0"), "NonNegative");
    const value_plan first = planner.plan_value(type, "A", "B", "");
    EXPECT_EQ(planner.plan_value(type, "C", "D", "").limits, first.limits);
}

TEST(PlanValues, TwoMeaningsOfOneConstantAreRefused) {
    value_planner planner;
    planner.plan_value(of("double", low("0"), "Owner_Member"), "A", "B", "small.xsd:1");
    EXPECT_THROW(planner.plan_value(of("double", low("1")), "Owner", "Member", "small.xsd:2"), schema_error);
}

TEST(PlanValues, AClassUsesEachConstantOnceInOrder) {
    value_planner planner;
    class_plan owner;
    for (const char* bound : {"2", "1", "2"}) {
        member_plan member;
        member.value =
            planner.plan_value(of("double", low(bound), std::string("From") + bound), "A", "B", "");
        owner.members.push_back(member);
    }
    const std::vector<limits_plan> limits = planner.limits_of(owner);
    ASSERT_EQ(limits.size(), 2u);
    EXPECT_EQ(limits[0].name, "k_From2");
    EXPECT_EQ(limits[1].name, "k_From1");
}

struct initial_case {
    const char* built_in;
    const char* text;
    bool starts;
};

void PrintTo(const initial_case& c, std::ostream* os) { *os << c.built_in << " '" << c.text << "'"; }

class InitialValue : public testing::TestWithParam<initial_case> {};

TEST_P(InitialValue, IsOneThatStorageCanStartWith) {
    value_planner planner;
    const value_plan value = planner.plan_value(of(GetParam().built_in), "Owner", "Member", "");
    if (GetParam().starts) {
        EXPECT_NO_THROW(check_initial(value, GetParam().text, "small.xsd:3"));
    } else {
        EXPECT_THROW(check_initial(value, GetParam().text, "small.xsd:3"), schema_error);
    }
}

const initial_case k_initial[] = {
    {"double", "2.0", true},         {"double", "-1.5e3", true},
    {"double", "INF", false},        {"double", "", false},
    {"double", ".5", false},         {"int", "-3", true},
    {"int", "3.0", false},           {"unsignedInt", "3", true},
    {"unsignedByte", "0", true},     {"boolean", "true", true},
    {"boolean", "1", false},         {"string", "any \"text\"", true},
    {"token", "text", true},         {"dateTime", "2020-01-01T00:00:00Z", false},
    {"base64Binary", "AAAA", false},
};
INSTANTIATE_TEST_SUITE_P(Values, InitialValue, testing::ValuesIn(k_initial));

}  // namespace
