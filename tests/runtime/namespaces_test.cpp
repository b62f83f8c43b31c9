#include "runtime/namespaces.h"

#include <gtest/gtest.h>

#include <climits>

namespace {

using namespace qbxV2;

constexpr char k_xsi[] = "http://www.w3.org/2001/XMLSchema-instance";
constexpr char k_xml[] = "http://www.w3.org/XML/1998/namespace";

TEST(EnumeratedNamespaces, KnowTwoNamespacesFromTheStart) {
    const c_enumerated_namespaces table;
    EXPECT_EQ(table.find_namespace(k_xsi), 5);
    EXPECT_EQ(table.find_namespace(k_xml), 2);
    EXPECT_STREQ(table.find_namespace_from_id(5), k_xsi);
    EXPECT_STREQ(table.find_namespace_from_id(2), k_xml);
    EXPECT_EQ(table.find_namespace("u"), 0);
    EXPECT_EQ(table.find_namespace_from_id(1000), nullptr);
    EXPECT_EQ(table.find_namespace_from_id(1), nullptr);
}

TEST(EnumeratedNamespaces, HandOutIdsFrom1000InOrderOfFirstSight) {
    c_enumerated_namespaces table;
    EXPECT_EQ(table.add_namespace("a"), 1000);
    EXPECT_EQ(table.add_namespace("b"), 1001);
    EXPECT_EQ(table.add_namespace("a"), 1000);
    EXPECT_EQ(table.add_namespace(""), 1002);
    EXPECT_STREQ(table.find_namespace_from_id(1001), "b");
    table.clear();
    EXPECT_EQ(table.find_namespace("a"), 0);
    EXPECT_EQ(table.find_namespace_from_id(1000), nullptr);
    EXPECT_EQ(table.add_namespace("b"), 1000);
    EXPECT_EQ(table.find_namespace(k_xsi), 5);
}

TEST(EnumeratedNamespaces, AGivenIdRaisesTheNextOneAndNeverReplacesAKnownOne) {
    c_enumerated_namespaces table;
    table.add_namespace("u", 2000);
    EXPECT_EQ(table.find_namespace("u"), 2000);
    EXPECT_EQ(table.add_namespace("v"), 2001);
    table.add_namespace("u", 3000);
    EXPECT_EQ(table.find_namespace("u"), 2000);
    EXPECT_EQ(table.add_namespace("w"), 3001);
    table.add_namespace("x", 7);
    EXPECT_EQ(table.add_namespace("y"), 3002);
}

TEST(EnumeratedNamespaces, TheFirstUriWithAnIdIsFoundFromIt) {
    c_enumerated_namespaces table;
    table.add_namespace("u", 2000);
    table.add_namespace("v", 2000);
    EXPECT_STREQ(table.find_namespace_from_id(2000), "u");
}

TEST(EnumeratedNamespaces, TheLargestIdIsNotExceeded) {
    c_enumerated_namespaces table;
    table.add_namespace("u", INT_MAX - 1);
    EXPECT_EQ(table.add_namespace("v"), INT_MAX);
    EXPECT_EQ(table.add_namespace("w"), INT_MAX);
    table.add_namespace("x", INT_MAX);
    EXPECT_EQ(table.add_namespace("y"), INT_MAX);
}

TEST(XmlLocal, XmlHasItsIdEverywhereAndCannotBeRedeclared) {
    c_xml_local scope;
    EXPECT_EQ(scope.find_namespace_id("xml"), 2);
    scope.add_namespace("xml", 1000);
    EXPECT_EQ(scope.find_namespace_id("xml"), 2);
    EXPECT_STREQ(scope.find_namespace_prefix(2), "xml");
    EXPECT_STREQ(scope.find_first_namespace_prefix(2), "xml");
}

TEST(XmlLocal, NothingIsFoundInAFreshScope) {
    const c_xml_local scope;
    EXPECT_EQ(scope.find_namespace_id(""), 0);
    EXPECT_EQ(scope.find_namespace_id("p"), 0);
    EXPECT_EQ(scope.find_namespace_prefix(1000), nullptr);
    EXPECT_EQ(scope.find_first_namespace_prefix(1000), nullptr);
}

TEST(XmlLocal, ADeclarationIsFoundThroughAnyNumberOfScopesWithoutAny) {
    c_xml_local root;
    root.add_namespace("p", 1000);
    const c_xml_local a(root);
    const c_xml_local b(a);
    const c_xml_local c(b);
    EXPECT_EQ(c.find_namespace_id("p"), 1000);
    EXPECT_EQ(c.find_namespace_id("q"), 0);
}

TEST(XmlLocal, TheInnerDeclarationHidesTheOuterOneWhileItLives) {
    c_xml_local root;
    root.add_namespace("p", 1000);
    const c_xml_local between(root);
    {
        c_xml_local inner(between);
        inner.add_namespace("p", 1001);
        inner.add_namespace("q", 1002);
        EXPECT_EQ(inner.find_namespace_id("p"), 1001);
        EXPECT_EQ(inner.find_namespace_id("q"), 1002);
        const c_xml_local child(inner);
        EXPECT_EQ(child.find_namespace_id("p"), 1001);
        inner.add_namespace("p", 1003);
        EXPECT_EQ(child.find_namespace_id("p"), 1003);
    }
    EXPECT_EQ(between.find_namespace_id("p"), 1000);
    EXPECT_EQ(between.find_namespace_id("q"), 0);
}

TEST(XmlLocal, ClearForgetsItsOwnDeclarationsOnly) {
    c_xml_local root;
    root.add_namespace("p", 1000);
    c_xml_local child(root);
    child.add_namespace("p", 1001);
    child.clear();
    EXPECT_EQ(child.find_namespace_id("p"), 1000);
    child.add_namespace("q", 1002);
    EXPECT_EQ(child.find_namespace_id("q"), 1002);
}

TEST(XmlLocal, PrefixesAreFoundFromIdsInnermostAndOutermost) {
    c_xml_local root;
    root.add_namespace("outer", 1000);
    root.add_namespace("second", 1000);
    c_xml_local middle(root);
    middle.add_namespace("other", 1001);
    c_xml_local inner(middle);
    inner.add_namespace("inner", 1000);
    EXPECT_STREQ(inner.find_namespace_prefix(1000), "inner");
    EXPECT_STREQ(inner.find_first_namespace_prefix(1000), "outer");
    EXPECT_STREQ(inner.find_namespace_prefix(1001), "other");
    EXPECT_STREQ(inner.find_first_namespace_prefix(1001), "other");
    EXPECT_EQ(inner.find_namespace_prefix(1002), nullptr);
}

}  // namespace
