#include "runtime/dtd.h"

#include <gtest/gtest.h>

#include "reading_paths.h"
#include "runtime/scanner.h"
#include "scan_trace.h"

namespace {

using namespace qbxV2;
using scan_trace::events;

struct Subset {
    const char* why;
    std::string subset;
    std::string outcome;
};
void PrintTo(const Subset& s, std::ostream* os) { *os << s.why << ": " << s.subset; }

class InternalSubset : public testing::TestWithParam<Subset> {};

TEST_P(InternalSubset, GivesEntitiesToTheContent) {
    EXPECT_EQ(events(std::string("<!DOCTYPE a").append(GetParam().subset).append("<a>&e;</a>")),
              GetParam().outcome);
}

constexpr char k_x[] = "<a> 'x' </a> EOF";

INSTANTIATE_TEST_SUITE_P(
    Good, InternalSubset,
    testing::Values(
        Subset{"an entity", " [<!ENTITY e 'x'>]>", k_x},
        Subset{"the other quote", "[<!ENTITY e \"x\">]>", k_x},
        Subset{"white space everywhere", " [\n <!ENTITY\te\r\n'x' >\n ] \n>", k_x},
        Subset{"the external id is passed over", " PUBLIC '-//x' \"y\" [<!ENTITY e 'x'>]>", k_x},
        Subset{"other declarations are passed over",
               "[<!ELEMENT a (#PCDATA)><!ATTLIST a b CDATA '>'><!NOTATION n SYSTEM \"]>\"><!ENTITY e 'x'>]>",
               k_x},
        Subset{"comments and instructions too",
               "[<!-- <!ENTITY e 'y'> --><?pi <!ENTITY e 'z'> ?><!ENTITY e 'x'>]>", k_x},
        Subset{"the last definition wins", "[<!ENTITY e '1'><!ENTITY e '2'>]>", "<a> '2' </a> EOF"},
        Subset{"a quote of the other kind in a value", "[<!ENTITY e \"'x'\">]>", "<a> ''x'' </a> EOF"},
        Subset{"character references are resolved at the definition", "[<!ENTITY e '&#60;b/&#x3E;'>]>",
               "<a> <b/> </a> EOF"},
        Subset{"entity references on use", "[<!ENTITY e '&f;'><!ENTITY f 'x'>]>", k_x},
        Subset{"what is behind the value is passed over", "[<!ENTITY e 'x' NDATA '>' >]>", k_x},
        Subset{"an instruction that begins and ends in one word goes on to the next end of one",
               "[<?pi?><!ENTITY e 'y'>?><!ENTITY f 'x'><!ENTITY e '&f;'>]>", k_x},
        Subset{"a line break in the text", "[<!ENTITY e '1\n2'>]>", "<a> '1\\x0A2' </a> EOF"}));

INSTANTIATE_TEST_SUITE_P(
    ParameterEntities, InternalSubset,
    testing::Values(
        Subset{"hold declarations", "[<!ENTITY % p \"<!ENTITY e 'x'>\"> %p;]>", k_x},
        Subset{"without ;", "[<!ENTITY % p \"<!ENTITY e 'x'>\"> %p ]>", k_x},
        Subset{"stand in values", "[<!ENTITY % p 'x'><!ENTITY e '%p;'>]>", k_x},
        Subset{"a quote in one doesn't end the value", "[<!ENTITY % p \"'\"><!ENTITY e '1%p;2'>]>",
               "<a> '1'2' </a> EOF"},
        Subset{"stand in names", "[<!ENTITY % p 'e'><!ENTITY %p; 'x'>]>", "<a> ERROR"},
        Subset{"stand within names", "[<!ENTITY % p 'bc'><!ENTITY a%p;d 'x'><!ENTITY e '&abcd;'>]>", k_x},
        Subset{"one within another", "[<!ENTITY % p '&#37;q;'><!ENTITY % q \"<!ENTITY e 'x'>\">%p;]>", k_x},
        Subset{"are no general entities", "[<!ENTITY % e 'x'>]>", "<a> ERROR"}));

INSTANTIATE_TEST_SUITE_P(
    Reports, InternalSubset,
    testing::Values(Subset{"an external entity has the keyword as its text", "[<!ENTITY e SYSTEM 'u'>]>",
                           " !2/17@1: External Entity definitions not supported <a> 'SYSTEM' </a> EOF"},
                    Subset{"a public one too", "[<!ENTITY e PUBLIC 'p' \"u\">]>",
                           " !2/17@1: External Entity definitions not supported <a> 'PUBLIC' </a> EOF"},
                    Subset{"another word", "[<!ENTITY e system 'u'>]>",
                           " !1/33@1: Unexpected value in Entity definition: system <a> 'system' </a> EOF"},
                    Subset{"no value", "[<!ENTITY e>]>",
                           " !1/33@1: Unexpected value in Entity definition:  <a> </a> EOF"},
                    Subset{"an unknown parameter entity is passed over", "[%u;<!ENTITY e 'x'>]>",
                           " !1/41@1: Entity '%u' not found <a> 'x' </a> EOF"},
                    Subset{"in a value too", "[<!ENTITY e '1%u;2'>]>",
                           " !1/41@1: Entity '%u' not found <a> '12' </a> EOF"}));

std::string refused(const char* what) {
    return std::string(" !0/9@1: DTD not Well Formed (").append(what).append(") ERROR");
}

INSTANTIATE_TEST_SUITE_P(
    Broken, InternalSubset,
    testing::Values(
        Subset{"stray content", "[x]>", refused("got x")},
        Subset{"no > behind ]", "[] x>", refused("expected '>', got x")},
        Subset{"the tag that follows is not >", "[]", refused("expected '>', got <")},
        Subset{"a recursive parameter entity", "[<!ENTITY % p '&#37;p;'>%p;]>",
               " !0/9@1: Recursive entity definition for: %p; ERROR"},
        Subset{"a recursive parameter entity in a value", "[<!ENTITY % p '<!ENTITY e \"&#37;p;\">'>%p;]>",
               " !0/9@1: Recursive entity definition for: <!ENTITY e \"%p;\"> ERROR"},
        Subset{"a parameter entity that refers to itself without ;", "[<!ENTITY % p '&#37;p'>%p;]>",
               " !0/9@1: Recursive entity definition for: %p ERROR"},
        Subset{"two that refer to each other without ;", "[<!ENTITY % p '&#37;q'><!ENTITY % q '&#37;p'>%p;]>",
               " !0/9@1: Recursive entity definition for: %q ERROR"},
        Subset{"a bad character reference in a value", "[<!ENTITY e '&#x;'>]>", "ERROR"}));

std::string cut(const std::string& subset) { return events(std::string("<!DOCTYPE a").append(subset)); }

TEST(InternalSubsetEnd, OfInputIsAFailureAtAnyPlace) {
    EXPECT_EQ(cut(""), "ERROR");
    EXPECT_EQ(cut(" SYSTEM 'x'"), "ERROR");
    const std::string at_end = refused("got \\xFF");
    EXPECT_EQ(cut("["), at_end);
    EXPECT_EQ(cut("[<"), at_end);
    EXPECT_EQ(cut("[<!ELEMENT a '>"), at_end);
    EXPECT_EQ(cut("[<!ENTITY e 'x'"), at_end);
    EXPECT_EQ(cut("[<!ENTITY e 'x"), at_end) << "the end of input ends the value";
    EXPECT_EQ(cut("[<!ENTITY e 'x&"), at_end);
    EXPECT_EQ(cut("[<!ENTITY e"), "ERROR");
    EXPECT_EQ(cut("[<!ENTITY"), "ERROR");
    EXPECT_EQ(cut("[<!-- "), "ERROR");
    EXPECT_EQ(cut("[<?pi "), "ERROR");
    EXPECT_EQ(cut("[]"), refused("expected '>', got \\xFF"));
}

TEST(InternalSubsetLines, OfEntityTextDontCount) {
    EXPECT_EQ(events("<!DOCTYPE a [<!ENTITY e '\n\n'>]><a>&e;x</b c>"),
              "<a> 'x' !1/23@3: XML not Well-Formed ERROR");
}

TEST(CallersParameterEntity, IsKnownToTheSubset) {
    const std::string text = "<!DOCTYPE a [%p;]><a>&e;</a>";
    c_read_string source(text);
    c_error errors;
    c_xml xml(source, errors, true);
    xml.add_parameter_entity("p", "<!ENTITY e 'x'>");
    c_xml_local scope;
    std::string name;
    EXPECT_EQ(xml.get_element_name(&scope, &name), EQXP_NAME);
    EXPECT_TRUE(xml.skip_start_tag(nullptr));
    EXPECT_TRUE(xml.get_element_value(&name, EQBX_WS_PRESERVE, true));
    EXPECT_EQ(name, "x");
}

struct Util {
    explicit Util(const std::string& behind)
        : text("<." + behind), source(text), errors(&log), getter(source, errors, true), util(getter) {
        getter.get();
        getter.get();
    }
    std::string text;
    c_read_string source;
    std::string log;
    reading_paths::RecordingErrors errors;
    c_get_for_xml getter;
    c_dtd_util util;
};

TEST(DtdUtil, AWordIsAppendedUpToWhiteSpaceOrGreaterThan) {
    Util u(" ab cd>");
    std::string out = "x";
    EXPECT_TRUE(u.util.get_entity_value(&out));
    EXPECT_EQ(out, "xab");
    EXPECT_EQ(u.util.get(), ' ');
    EXPECT_TRUE(u.util.get_entity_value(&out));
    EXPECT_EQ(out, "xabcd");
    EXPECT_EQ(u.util.get(), '>');
    EXPECT_FALSE(u.util.get_entity_value(&out));
    EXPECT_EQ(&u.util.getter(), &u.getter);
}

TEST(DtdUtil, AQuotedValueNeedsAQuote) {
    Util u(" x 'a\"&e;&#65;b' ");
    std::string out = "before";
    EXPECT_FALSE(u.util.get_quoted_entity_value(&out));
    EXPECT_EQ(out, "before");
    EXPECT_TRUE(u.util.get_quoted_entity_value(&out));
    EXPECT_EQ(out, "a\"&e;Ab");
    EXPECT_FALSE(u.util.get_quoted_entity_value(&out)) << "the end of input";
}

// Intended: the character behind an ampersand stays in the value, whatever it is.
TEST(DtdUtil, BehindAnAmpersandEvenTheQuoteBelongsToTheValue) {
    Util u("'a&'b' ");
    std::string out;
    EXPECT_TRUE(u.util.get_quoted_entity_value(&out));
    EXPECT_EQ(out, "a&'b");
}

TEST(InternalDtd, ResetHasNothingToDo) {
    Util u(" [<!ENTITY e 'x'>]>");
    c_internal_dtd dtd(u.getter);
    EXPECT_TRUE(dtd.read_doctype_decl());
    dtd.reset();
    const char* value = nullptr;
    EXPECT_TRUE(u.getter.get_general_entity("e", &value));
}

}  // namespace
