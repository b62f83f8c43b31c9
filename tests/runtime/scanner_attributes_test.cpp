#include <gtest/gtest.h>

#include "reading_paths.h"
#include "runtime/scanner.h"
#include "scan_trace.h"

namespace {

using namespace qbxV2;
using scan_trace::attribute;
using scan_trace::events;
using namespace std::string_literals;

constexpr char k_fatal_quote[] = " !0/23@1: Schema is not Well Formed (expected '\"' or ''', got ";

struct Tag {
    const char* why;
    std::string text;
    std::string outcome;
};
void PrintTo(const Tag& t, std::ostream* os) { *os << t.why << ": " << t.text; }

class StartTag : public testing::TestWithParam<Tag> {};
TEST_P(StartTag, GivesTheseAttributes) { EXPECT_EQ(events(GetParam().text), GetParam().outcome); }

INSTANTIATE_TEST_SUITE_P(
    Good, StartTag,
    testing::Values(Tag{"both quotes", "<a b=\"1\" c='2'/>", "<a b=[1] c=[2]/> EOF"},
                    Tag{"the other quote within", "<a b=\"'\" c='\"'></a>", "<a b=['] c=[\"]> </a> EOF"},
                    Tag{"white space around =", "<a b = '1'\n\tc\r\n=\r\n'2'/>", "<a b=[1] c=[2]/> EOF"},
                    Tag{"no white space between attributes", "<a b='1'c='2'/>", "<a b=[1] c=[2]/> EOF"},
                    Tag{"< and > in a value", "<a b='<x>'/>", "<a b=[<x>]/> EOF"},
                    Tag{"line ends in a value", "<a b='1\r\n2\r3\n4'/>", "<a b=[1\\x0A2\\x0A3\\x0A4]/> EOF"},
                    Tag{"bytes from 0x80", "<a b='\xC3\xA9' \xC3\xA9='\xE2\x82\xAC'/>",
                        "<a b=[\\xC3\\xA9] \\xC3\\xA9=[\\xE2\\x82\\xAC]/> EOF"},
                    Tag{"duplicates are not detected", "<a b='1' b='2'/>", "<a b=[1] b=[2]/> EOF"},
                    Tag{"an empty value", "<a b=''/>", "<a b=[]/> EOF"},
                    Tag{"xmlns is kept apart", "<a xmlns='u' b='1' xmlns:p='v'/>", "<a b=[1]/> EOF"},
                    Tag{"xmlnsfoo is an ordinary name", "<a xmlnsfoo='1' xml:b='2' x='3' xmln='4'/>",
                        "<a xmlnsfoo=[1] xml:b=[2] x=[3] xmln=[4]/> EOF"},
                    Tag{"references", "<a b='&lt;&#65;&#x42;&amp;'/>", "<a b=[<AB&]/> EOF"},
                    Tag{"a reference without ;", "<a b='&lt x'/>", "<a b=[< x]/> EOF"}));

INSTANTIATE_TEST_SUITE_P(
    Fatal, StartTag,
    testing::Values(Tag{"no quote", "<a b=c/>", k_fatal_quote + "c) ERROR"s},
                    Tag{"no =", "<a b/>",
                        " !0/23@1: Schema is not Well Formed (expected '=', got '/') ERROR"},
                    Tag{"no = behind white space", "<a b c='1'/>",
                        " !0/23@1: Schema is not Well Formed (expected '=', got 'c') ERROR"},
                    Tag{"the end behind a name", "<a b", " !0/34@1: Unexpected end of file ERROR"},
                    Tag{"the end behind xmlns", "<a xmlns", " !0/34@1: Unexpected end of file ERROR"},
                    Tag{"the end behind =", "<a b=", k_fatal_quote + "\\xFF) ERROR"s},
                    Tag{"the end in a value", "<a b='1", k_fatal_quote + "\\xFF) ERROR"s},
                    Tag{"the wrong quote", "<a b='1\"/>", k_fatal_quote + "\\xFF) ERROR"s},
                    Tag{"no quote behind xmlns", "<a xmlns=u/>", k_fatal_quote + "u) ERROR"s}));

INSTANTIATE_TEST_SUITE_P(
    Failing, StartTag,
    testing::Values(Tag{"an unknown entity in a value", "<a b='x&u;y'/>", "<a b=[x&u;] FAIL"},
                    Tag{"a bad character reference in a value", "<a b='&#x;'/>", "<a b=[] FAIL"},
                    Tag{"the end behind a value: no report", "<a b='1'", "ERROR"},
                    Tag{"an unknown entity in a namespace declaration", "<a xmlns='&u;'/>", "ERROR"}));

// A NUL ends the value in the buffer, and what is behind it is read as a name. All positions stay in the
// buffer.
INSTANTIATE_TEST_SUITE_P(
    Nul, StartTag,
    testing::Values(Tag{"in a value", "<a b='1\0c'/>"s, "<a b=[1] c=[]/> EOF"},
                    Tag{"at the end of a value", "<a b='1\0' c='2'/>"s, "<a b=[1] =[] '2=[]/> EOF"},
                    Tag{"two of them", "<a b='1\0\0\0c\0d'/>"s, "<a b=[1] =[c] d=[]/> EOF"}));

TEST(AttributeValue, FollowsTheWhiteSpaceMode) {
    const std::string tag = "<a b=' \t1\n &#9;2&#32; '/>";
    EXPECT_EQ(attribute(tag, EQBX_WS_PRESERVE), "[ \\x091\\x0A \\x092  ]");
    EXPECT_EQ(attribute(tag, EQBX_WS_REPLACE), "[  1   2  ]");
    EXPECT_EQ(attribute(tag, EQBX_WS_COLLAPSE), "[1 2]");
    EXPECT_EQ(attribute("<a b='x'/>", static_cast<eqbx_whitespace>(9)), "[]");
}

/// A scanner behind the name of the first element of a text.
struct AtElement {
    explicit AtElement(const std::string& document)
        : text(document), source(text), xml(source, errors, true) {
        event = xml.get_element_name(&scope, &name);
    }
    std::string text;
    c_read_string source;
    c_error errors;
    c_xml xml;
    c_xml_local scope;
    std::string name;
    std::string value;
    eqxp_xml_event event;
};

TEST(AttributeName, SaysHowTheTagEnds) {
    AtElement empty("<a/>");
    EXPECT_EQ(empty.event, EQXP_NAME);
    EXPECT_EQ(empty.xml.get_attribute_name(&empty.name, false), EQXP_END_TAG);
    EXPECT_EQ(empty.name, "");
    AtElement open("<a>");
    EXPECT_EQ(open.xml.get_attribute_name(&open.name, false), EQXP_START_TAG_END);
}

TEST(AttributeName, InAProcessingInstructionTheEndIsAnotherOne) {
    AtElement pi("<a b='1'?>");
    EXPECT_EQ(pi.xml.get_attribute_name(&pi.name, true), EQXP_NAME);
    EXPECT_TRUE(pi.xml.skip_attribute_value());
    EXPECT_EQ(pi.xml.get_attribute_name(&pi.name, true), EQXP_END_TAG);
    AtElement tag("<a/>");
    EXPECT_EQ(tag.xml.get_attribute_name(&tag.name, true), EQXP_ERROR);
    EXPECT_EQ(tag.errors.get_last_error(), EQBX_NOT_WELL_FORMED);
}

TEST(AttributeName, AfterAFatalReportNoAttributeIsDelivered) {
    AtElement at("<a b='1' c='2'/>");
    EXPECT_EQ(at.xml.get_attribute_name(&at.name, false), EQXP_NAME);
    at.errors.error(EQBX_ET_FATAL, EQBX_BAD_DTD, "the end");
    EXPECT_EQ(at.xml.get_attribute_name(&at.name, false), EQXP_ERROR);
}

TEST(SkipAttributeValue, StepsOverAValueWithoutLookingAtIt) {
    AtElement at("<a b='&unknown;' c='2'/>");
    at.xml.get_attribute_name(&at.name, false);
    EXPECT_TRUE(at.xml.skip_attribute_value());
    EXPECT_EQ(at.xml.get_attribute_name(&at.name, false), EQXP_NAME);
    EXPECT_EQ(at.name, "c");
    EXPECT_TRUE(at.xml.get_attribute_value(&at.value, EQBX_WS_PRESERVE));
    EXPECT_EQ(at.value, "2");
}

TEST(AttributeValue, ThatFailsIsFollowedByTheNextAttribute) {
    for (const char* const bad : {"x&u;y", "&u;", "&#;", "1&#x110000;2&u;"}) {
        AtElement at(reading_paths::join({"<a b='", bad, "' c='2'/>"}));
        at.xml.get_attribute_name(&at.name, false);
        EXPECT_FALSE(at.xml.get_attribute_value(&at.value, EQBX_WS_PRESERVE));
        EXPECT_EQ(at.xml.get_attribute_name(&at.name, false), EQXP_NAME);
        EXPECT_EQ(at.name, "c");
        EXPECT_TRUE(at.xml.get_attribute_value(&at.value, EQBX_WS_PRESERVE));
        EXPECT_EQ(at.value, "2");
        EXPECT_EQ(at.xml.get_attribute_name(&at.name, false), EQXP_END_TAG);
    }
}

TEST(NamedAttribute, IsFoundByNamespaceAndLocalNameAndReadingStartsOver) {
    AtElement at("<a xmlns:p='u' b='1' p:c='&#50;' c='3'/>");
    EXPECT_TRUE(at.xml.get_named_attribute(&at.scope, 1000, "c", &at.value));
    EXPECT_EQ(at.value, "2");
    EXPECT_TRUE(at.xml.get_named_attribute(&at.scope, 0, "c", &at.value));
    EXPECT_EQ(at.value, "3");
    EXPECT_EQ(at.xml.get_attribute_name(&at.name, false), EQXP_NAME);
    EXPECT_EQ(at.name, "b");
}

TEST(NamedAttribute, AMissingOneLeavesTheReadPositionAtTheFirst) {
    AtElement at("<a b='1' c='2'/>");
    EXPECT_FALSE(at.xml.get_named_attribute(&at.scope, 0, "d", &at.value));
    EXPECT_FALSE(at.xml.get_named_attribute(&at.scope, 1, "b", &at.value))
        << "no prefix is id 0 here, never 1";
    EXPECT_EQ(at.xml.get_attribute_name(&at.name, false), EQXP_NAME);
    EXPECT_EQ(at.name, "b");
}

TEST(NamedAttribute, IsLookedForFromTheReadPositionOn) {
    AtElement at("<a b='1' c='2'/>");
    at.xml.get_attribute_name(&at.name, false);
    at.xml.skip_attribute_value();
    EXPECT_FALSE(at.xml.get_named_attribute(&at.scope, 0, "b", &at.value));
    EXPECT_TRUE(at.xml.get_named_attribute(&at.scope, 0, "b", &at.value)) << "the search started over";
}

// Intended: here an attribute without a prefix takes the default namespace.
TEST(NamedAttribute, WithoutAPrefixHasTheDefaultNamespace) {
    AtElement at("<a xmlns='u' b='1'/>");
    EXPECT_TRUE(at.xml.get_named_attribute(&at.scope, 1000, "b", &at.value));
    EXPECT_EQ(at.value, "1");
}

// Intended: found is found, also when the value breaks off at a bad reference.
TEST(NamedAttribute, IsFoundEvenWhenItsValueFails) {
    AtElement at("<a b='1&u;2'/>");
    EXPECT_TRUE(at.xml.get_named_attribute(&at.scope, 0, "b", &at.value));
    EXPECT_EQ(at.value, "1&u;");
}

struct TypeCase {
    const char* why;
    const char* tag;
    bool found;
    int ns_id;
    const char* name;
};
void PrintTo(const TypeCase& c, std::ostream* os) { *os << c.why; }

class XsiType : public testing::TestWithParam<TypeCase> {};

TEST_P(XsiType, IsCutUp) {
    AtElement at(GetParam().tag);
    int ns_id = -7;
    std::string name = "untouched";
    EXPECT_EQ(at.xml.get_xsi_type(&at.scope, &ns_id, &name), GetParam().found);
    EXPECT_EQ(ns_id, GetParam().ns_id);
    EXPECT_EQ(name, GetParam().name);
}

#define XSI "xmlns:i='http://www.w3.org/2001/XMLSchema-instance' "
INSTANTIATE_TEST_SUITE_P(
    Cases, XsiType,
    testing::Values(TypeCase{"a prefix", "<a " XSI "xmlns:p='u' i:type='p:T'/>", true, 1000, "T"},
                    TypeCase{"no prefix and no default namespace", "<a " XSI "i:type='T'/>", true, 1, "T"},
                    TypeCase{"no prefix under a default namespace", "<a " XSI "xmlns='u' i:type='T'/>", true,
                             1000, "T"},
                    TypeCase{"an undeclared prefix", "<a " XSI "i:type='p:T'/>", true, 0, "T"},
                    TypeCase{"none", "<a " XSI "type='T'/>", false, -7, "untouched"},
                    TypeCase{"another namespace", "<a xmlns:i='u' i:type='T'/>", false, -7, "untouched"}));

TEST(XsiAttribute, IsAnyNameWhosePrefixIsBoundToTheInstanceNamespace) {
    AtElement at("<a " XSI "/>");
    EXPECT_TRUE(at.xml.is_xsi_attribute(&at.scope, "i:type"));
    EXPECT_TRUE(at.xml.is_xsi_attribute(&at.scope, "i:anything"));
    EXPECT_FALSE(at.xml.is_xsi_attribute(&at.scope, "xsi:type"));
    EXPECT_FALSE(at.xml.is_xsi_attribute(&at.scope, "type"));
}

TEST(NamespaceDeclarations, EnterTheScopeInDocumentOrder) {
    AtElement at("<a xmlns:p='u' xmlns='v' xmlns:q='u' xmlns:p='w'/>");
    EXPECT_EQ(at.scope.find_namespace_id("q"), 1000);
    EXPECT_EQ(at.scope.find_namespace_id(""), 1001);
    EXPECT_EQ(at.scope.find_namespace_id("p"), 1002);
    EXPECT_EQ(at.xml.get_ns_id(&at.scope, "a"), 1001);
    EXPECT_EQ(at.xml.get_ns_id(&at.scope, "q:a"), 1000);
    EXPECT_STREQ(at.xml.find_namespace_from_id(1002), "w");
}

TEST(NamespaceDeclarations, AnEmptyDefaultIsNoNamespaceButAnEmptyPrefixedOneIsAUri) {
    AtElement at("<a xmlns='' xmlns:p=''/>");
    EXPECT_EQ(at.scope.find_namespace_id(""), 1);
    EXPECT_EQ(at.scope.find_namespace_id("p"), 1000);
    EXPECT_STREQ(at.xml.find_namespace_from_id(1000), "");
}

TEST(NamespaceDeclarations, AreLookedAtAfterTheirReferencesAreExpanded) {
    AtElement at("<!DOCTYPE a [<!ENTITY e ''>]><a xmlns='&e;' xmlns:p='&e;'/>");
    EXPECT_EQ(at.scope.find_namespace_id(""), 1) << "nothing is left of the default one";
    EXPECT_EQ(at.scope.find_namespace_id("p"), 1000);
}

TEST(NamespaceDeclarations, ExpandReferencesInTheUri) {
    AtElement at("<!DOCTYPE a [<!ENTITY e 'x'>]><a xmlns:p='u&#47;&amp;&e;' xmlns='&#117;/&#38;x'/>");
    EXPECT_EQ(at.event, EQXP_NAME);
    EXPECT_STREQ(at.xml.find_namespace_from_id(at.scope.find_namespace_id("p")), "u/&x");
    EXPECT_EQ(at.scope.find_namespace_id("p"), at.scope.find_namespace_id(""));
}

TEST(NamespaceDeclarations, ANameThatOnlyBeginsWithXmlnsIsNone) {
    AtElement at("<a xmlnsx='u' xmlns-p='v'/>");
    EXPECT_EQ(at.scope.find_namespace_id("x"), 0);
    EXPECT_EQ(at.scope.find_namespace_id(""), 0);
    EXPECT_EQ(at.xml.get_attribute_name(&at.name, false), EQXP_NAME);
    EXPECT_EQ(at.name, "xmlnsx");
}

}  // namespace
