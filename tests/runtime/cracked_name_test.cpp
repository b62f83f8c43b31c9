#include "runtime/cracked_name.h"

#include <gtest/gtest.h>

namespace {

using qbxV2::c_cracked_name;
using qbxV2::c_xml_local;

struct Name {
    const char* why;
    const char* name;
    bool has_prefix;
    const char* prefix;
    const char* local;
    int ns_id;
    int element_ns_id;
};
void PrintTo(const Name& n, std::ostream* os) { *os << n.why; }

class CrackedName : public testing::TestWithParam<Name> {};

TEST_P(CrackedName, IsCutAtTheFirstColon) {
    c_xml_local scope;
    scope.add_namespace("p", 1000);
    const Name& n = GetParam();
    const c_cracked_name cracked(&scope, n.name);
    EXPECT_EQ(cracked.get_full_name(), n.name);
    EXPECT_EQ(cracked.get_has_ns_prefix(), n.has_prefix);
    EXPECT_EQ(cracked.get_ns_prefix(), n.prefix);
    EXPECT_EQ(cracked.get_local_name(), n.local);
    EXPECT_EQ(std::string(cracked.local_name_data(), cracked.local_name_size()), n.local);
    EXPECT_EQ(cracked.get_ns_id(), n.ns_id);
    EXPECT_EQ(cracked.get_element_ns_id(), n.element_ns_id);
}

INSTANTIATE_TEST_SUITE_P(
    WithoutADefaultNamespace, CrackedName,
    testing::Values(Name{"a declared prefix", "p:a", true, "p", "a", 1000, 1000},
                    Name{"an undeclared prefix stays undeclared", "q:a", true, "q", "a", 0, 0},
                    Name{"no prefix means no namespace for an element", "a", false, "", "a", 0, 1},
                    Name{"the xml prefix", "xml:lang", true, "xml", "lang", 2, 2},
                    Name{"two colons", "p:b:c", true, "p", "b:c", 1000, 1000},
                    Name{"nothing behind the colon", "p:", true, "p", "", 1000, 1000},
                    Name{"nothing before the colon", ":a", true, "", "a", 0, 0},
                    Name{"the empty name", "", false, "", "", 0, 1}));

TEST(CrackedNameDefaults, AnUnprefixedNameTakesTheDefaultNamespace) {
    c_xml_local scope;
    scope.add_namespace("", 1000);
    EXPECT_EQ(c_cracked_name(&scope, "a").get_ns_id(), 1000);
    EXPECT_EQ(c_cracked_name(&scope, "a").get_element_ns_id(), 1000);
    scope.add_namespace("", 1);
    EXPECT_EQ(c_cracked_name(&scope, "a").get_ns_id(), 1);
    EXPECT_EQ(c_cracked_name(&scope, "a").get_element_ns_id(), 1);
}

TEST(CrackedNameDefaults, IsEmptyAfterConstruction) {
    const c_cracked_name name;
    EXPECT_EQ(name.get_full_name(), "");
    EXPECT_EQ(name.get_local_name(), "");
    EXPECT_EQ(name.get_ns_prefix(), "");
    EXPECT_FALSE(name.get_has_ns_prefix());
    EXPECT_EQ(name.get_ns_id(), 0);
}

TEST(CrackedNameDefaults, TheIdIsThatOfTheTimeOfTheCall) {
    c_xml_local scope;
    scope.add_namespace("p", 1000);
    c_cracked_name name(&scope, "p:a");
    scope.add_namespace("p", 1001);
    EXPECT_EQ(name.get_ns_id(), 1000);
    EXPECT_EQ(name.get_local_name(), "a");
    name.set(&scope, "bc");
    EXPECT_EQ(name.get_local_name(), "bc");
    EXPECT_EQ(name.get_ns_prefix(), "");
}

}  // namespace
