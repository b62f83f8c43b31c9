#include "codegen/plan_positions.h"

#include <gtest/gtest.h>

#include <ostream>
#include <string>
#include <vector>

namespace {

using vrl_codegen::class_kind;
using vrl_codegen::class_plan;
using vrl_codegen::member_kind;
using vrl_codegen::member_plan;
using vrl_codegen::row_range;

/// A letter for each child: r(equired), o(ptional), t(olerated when absent), + one or more, * any number;
/// G, g, M, m are groups: required, optional, one or more, any number.
struct positions_case {
    std::string children;
    row_range first;
    std::vector<row_range> next;
};

void PrintTo(const positions_case& c, std::ostream* os) { *os << "'" << c.children << "'"; }

member_plan child(char letter) {
    member_plan member;
    const std::string required = "r+GMt";
    member.required = required.find(letter) != std::string::npos;
    member.read_optional = letter == 't';
    switch (letter) {
        case '+':
        case '*':
            member.kind = member_kind::object_list;
            break;
        case 'G':
        case 'g':
            member.kind = member_kind::group;
            break;
        case 'M':
        case 'm':
            member.kind = member_kind::group_list;
            break;
        default:
            member.kind = member_kind::value;
    }
    return member;
}

class_plan class_with(const std::string& children) {
    class_plan made;
    member_plan attribute;
    attribute.kind = member_kind::attribute;
    made.members.push_back(attribute);
    for (const char letter : children) made.members.push_back(child(letter));
    return made;
}

std::vector<row_range> next_of(const class_plan& made) {
    std::vector<row_range> next;
    for (const member_plan* member : made.children()) next.push_back(member->next);
    return next;
}

class Positions : public testing::TestWithParam<positions_case> {};

TEST_P(Positions, NamesReachToTheNextChildThatHasToBeThere) {
    class_plan made = class_with(GetParam().children);
    plan_positions(made);
    EXPECT_EQ(made.first_names, GetParam().first);
    EXPECT_EQ(next_of(made), GetParam().next);
}

const positions_case k_single[] = {
    {"", {0, 0}, {}},        {"r", {0, 1}, {{1, 1}}}, {"o", {0, 1}, {{1, 1}}},
    {"+", {0, 1}, {{0, 1}}}, {"*", {0, 1}, {{0, 1}}}, {"G", {0, 1}, {{1, 1}}},
    {"g", {0, 1}, {{1, 1}}}, {"M", {0, 1}, {{0, 1}}}, {"m", {0, 1}, {{0, 1}}},
};
INSTANTIATE_TEST_SUITE_P(OneChild, Positions, testing::ValuesIn(k_single));

const positions_case k_pairs[] = {
    {"rr", {0, 1}, {{1, 2}, {2, 2}}}, {"ro", {0, 1}, {{1, 2}, {2, 2}}}, {"or", {0, 2}, {{1, 2}, {2, 2}}},
    {"oo", {0, 2}, {{1, 2}, {2, 2}}}, {"r+", {0, 1}, {{1, 2}, {1, 2}}}, {"r*", {0, 1}, {{1, 2}, {1, 2}}},
    {"o+", {0, 2}, {{1, 2}, {1, 2}}}, {"o*", {0, 2}, {{1, 2}, {1, 2}}}, {"+r", {0, 1}, {{0, 2}, {2, 2}}},
    {"+o", {0, 1}, {{0, 2}, {2, 2}}}, {"*r", {0, 2}, {{0, 2}, {2, 2}}}, {"*o", {0, 2}, {{0, 2}, {2, 2}}},
    {"++", {0, 1}, {{0, 2}, {1, 2}}}, {"+*", {0, 1}, {{0, 2}, {1, 2}}}, {"*+", {0, 2}, {{0, 2}, {1, 2}}},
    {"**", {0, 2}, {{0, 2}, {1, 2}}}, {"rG", {0, 1}, {{1, 2}, {2, 2}}}, {"og", {0, 2}, {{1, 2}, {2, 2}}},
    {"Gr", {0, 1}, {{1, 2}, {2, 2}}}, {"go", {0, 2}, {{1, 2}, {2, 2}}}, {"Mr", {0, 1}, {{0, 2}, {2, 2}}},
    {"mr", {0, 2}, {{0, 2}, {2, 2}}}, {"oM", {0, 2}, {{1, 2}, {1, 2}}}, {"om", {0, 2}, {{1, 2}, {1, 2}}},
};
INSTANTIATE_TEST_SUITE_P(TwoChildren, Positions, testing::ValuesIn(k_pairs));

const positions_case k_more[] = {
    {"oro", {0, 2}, {{1, 2}, {2, 3}, {3, 3}}},
    {"ooor", {0, 4}, {{1, 4}, {2, 4}, {3, 4}, {4, 4}}},
    {"*o+or", {0, 3}, {{0, 3}, {1 + 1, 3}, {2, 5}, {4, 5}, {5, 5}}},
    {"rmoG", {0, 1}, {{1, 4}, {1, 4}, {3, 4}, {4, 4}}},
    {"+++", {0, 1}, {{0, 2}, {1, 3}, {2, 3}}},
};
INSTANTIATE_TEST_SUITE_P(MoreChildren, Positions, testing::ValuesIn(k_more));

// A required child whose absence is no error on reading doesn't end the reach.
const positions_case k_tolerated[] = {
    {"t", {0, 1}, {{1, 1}}},
    {"tr", {0, 2}, {{1, 2}, {2, 2}}},
    {"rtor", {0, 1}, {{1, 4}, {2, 4}, {3, 4}, {4, 4}}},
};
INSTANTIATE_TEST_SUITE_P(ToleratedAbsence, Positions, testing::ValuesIn(k_tolerated));

TEST(PositionsOfAChoice, AreAllOptionsEverywhere) {
    class_plan made = class_with("rrr");
    made.kind = class_kind::choice;
    plan_positions(made);
    EXPECT_EQ(made.first_names, (row_range{0, 3}));
    EXPECT_EQ(next_of(made), (std::vector<row_range>{{0, 3}, {0, 3}, {0, 3}}));
}

}  // namespace
