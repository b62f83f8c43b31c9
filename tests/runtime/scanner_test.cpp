#include "runtime/scanner.h"

#include <gtest/gtest.h>

#include "reading_paths.h"
#include "scan_trace.h"

namespace {

using namespace qbxV2;
using scan_trace::events;
using scan_trace::value;
using namespace std::string_literals;

struct Document {
    const char* why;
    std::string text;
    std::string outcome;
};
void PrintTo(const Document& d, std::ostream* os) { *os << d.why << ": " << d.text; }

class Scanner : public testing::TestWithParam<Document> {};
TEST_P(Scanner, GivesTheseEvents) { EXPECT_EQ(events(GetParam().text), GetParam().outcome); }

INSTANTIATE_TEST_SUITE_P(
    Elements, Scanner,
    testing::Values(
        Document{"an empty document is no error", "", "EOF"}, Document{"nor is a blank one", " \n", "EOF"},
        Document{"an empty-element tag", "<a/>", "<a/> EOF"},
        Document{"a start tag and an end tag", "<a></a>", "<a> </a> EOF"},
        Document{"names of all name characters", "<_a:b-c.d1></_a:b-c.d1>", "<_a:b-c.d1> </_a:b-c.d1> EOF"},
        Document{"a colon starts a name", "<:a/>", "<:a/> EOF"},
        Document{"every byte from 0x80 is a name character", "<\xC3\xA9\xE2\x82\xAC/>",
                 "<\\xC3\\xA9\\xE2\\x82\\xAC/> EOF"},
        Document{"a name of a letter and one from 0x80", "<a\xC3\xA9/>", "<a\\xC3\\xA9/> EOF"},
        Document{"white space in tags", "<a\t\n>\n</a\r\n>", "<a> </a> EOF"},
        Document{"white space between / and >", "<a / >", "<a/> EOF"},
        Document{"elements within elements", "<a><b/><c>1</c></a>", "<a> <b/> <c> '1' </c> </a> EOF"},
        Document{"nothing stops reading behind the root", "<a/><b/>", "<a/> <b/> EOF"},
        Document{"the scanner doesn't pair tags", "</a><b>", "</a> <b> EOF"}));

INSTANTIATE_TEST_SUITE_P(
    BadMarkup, Scanner,
    testing::Values(Document{"a name cut by the end", "<ab", " !1/23@1: XML not Well-Formed ERROR"},
                    Document{"a digit first", "<1a>x</a>", " !1/23@1: XML not Well-Formed ERROR"},
                    Document{"white space first", "< a>", " !1/23@1: XML not Well-Formed ERROR"},
                    Document{"nothing behind <", "<", " !1/23@1: XML not Well-Formed ERROR"},
                    Document{"no name in an end tag: no report", "</>", "ERROR"},
                    Document{"no > in an end tag", "</a b>", " !1/23@1: XML not Well-Formed ERROR"},
                    Document{"an end tag cut by the end", "</a", " !1/23@1: XML not Well-Formed ERROR"},
                    Document{"other markup: no report", "<!x>", "ERROR"},
                    Document{"<!- is other markup", "<!-x>", "ERROR"},
                    Document{"<!DOC is other markup", "<!DOC a>", "ERROR"},
                    Document{"a bad CDATA opening", "<![CDAT[x]]>", " !1/23@1: XML not Well-Formed ERROR"},
                    Document{"a comment without an end: no report", "<!-- a", "ERROR"},
                    Document{"an instruction without an end: no report", "<?pi a", "ERROR"},
                    Document{"a start tag cut by the end: no report", "<a ", "ERROR"},
                    Document{"a stray character in a tag", "<a !>", "<a !1/23@1: XML not well-formed ERROR"},
                    Document{"only ? ends a processing instruction's attributes", "<a ?>",
                             "<a !1/23@1: XML not well-formed ERROR"},
                    Document{"no > behind /", "<a /x>", "<a !1/23@1: XML not well-formed ERROR"}));

INSTANTIATE_TEST_SUITE_P(
    Text, Scanner,
    testing::Values(Document{"leading white space goes, the rest stays", "<a> \n x \n y </a>",
                             "<a> 'x \\x0A y ' </a> EOF"},
                    Document{"text outside the root element is delivered", "x<a/>y",
                             " !0/6@1: Unrecognised character encoding EOF"},
                    Document{"also behind white space", " x<a/> y", "'x' <a/> 'y' EOF"},
                    Document{"up to the end of input", "<a>x", "<a> 'x' EOF"},
                    Document{"bytes from 0x80", "<a>\xC3\xA9</a>", "<a> '\\xC3\\xA9' </a> EOF"},
                    Document{"predefined entities", "<a>&lt;&gt;&amp;&apos;&quot;</a>",
                             "<a> '<>&'\"' </a> EOF"},
                    Document{"a reference later on", "<a>x&#33;y</a>", "<a> 'x!y' </a> EOF"},
                    Document{"an unknown entity", "<a>&u;</a>", "<a> ERROR"},
                    Document{"an unknown entity later on", "<a>x&u;</a>", "<a> ERROR"},
                    Document{"a NUL is a character", "<a>\0</a>"s, "<a> '\\x00' </a> EOF"}));

INSTANTIATE_TEST_SUITE_P(
    Sections, Scanner,
    testing::Values(Document{"a CDATA section", "<a><![CDATA[<x> & \n]]></a>", "<a> '<x> & \\x0A' </a> EOF"},
                    Document{"brackets before the end", "<![CDATA[a]]]>", "'a]' EOF"},
                    Document{"more brackets before the end", "<![CDATA[]]]]>", "']]' EOF"},
                    Document{"no text", "<![CDATA[]]>", "'' EOF"},
                    Document{"brackets within", "<![CDATA[a]b]]c]>d]]>", "'a]b]]c]>d' EOF"},
                    Document{"the end of input ends it", "<![CDATA[a]", "'a' EOF"},
                    Document{"it stands apart from text", "<a>x<![CDATA[y]]>z</a>",
                             "<a> 'x' 'y' 'z' </a> EOF"},
                    Document{"a comment", "<!-- <a> & -- --><a/>", "<a/> EOF"},
                    Document{"a comment with three dashes at its end is a warning", "<!----->\n<a/>",
                             " !2/8@1: End of comment not Well-Formed <a/> EOF"},
                    Document{"a comment ending in --->", "<!-- c ---><a/>",
                             " !2/8@1: End of comment not Well-Formed <a/> EOF"},
                    Document{"one or two dashes don't end a comment", "<!--> -> --><a/>", "<a/> EOF"},
                    Document{"a processing instruction",
                             "<?pi <a> ? > ?"
                             "?><a/>",
                             "<a/> EOF"}));

INSTANTIATE_TEST_SUITE_P(
    Prolog, Scanner,
    testing::Values(
        Document{"a declaration", "<?xml version='1.0'?><a/>", "<a/> EOF"},
        Document{"a comment is no first event", "<!-- c --><?xml version=\"1.0\"?><a/>", "<a/> EOF"},
        Document{"nor is white space, an instruction, or a declaration",
                 "\n<?pi?><?xml version='1.0'?><?xml version='1.1'?><a/>", "<a/> EOF"},
        Document{"an instruction whose target is the beginning of xml goes on to the next ?>",
                 "<?xm?><a/>?><b/>", "<b/> EOF"},
        Document{"a declaration behind an element is fatal", "<a/><?xml version=\"1.0\"?><b/>",
                 "<a/> !0/13@1: XML declaration not at start of document ERROR"},
        Document{"a declaration behind text is fatal", " x<?xml version=\"1.0\"?><b/>",
                 "'x' !0/13@1: XML declaration not at start of document ERROR"},
        Document{"every target that begins with xml is a declaration", "<?xml-stylesheet href=\"x\"?><a/>",
                 " !1/13@1: Version not present in XML Decl ERROR"},
        Document{"a document type declaration", "<!DOCTYPE a SYSTEM 'x'><a/>", "<a/> EOF"},
        Document{"behind comments and instructions", "<!-- --><?pi?><!DOCTYPE a><a/>", "<a/> EOF"},
        Document{"not behind an element", "<a/><!DOCTYPE a>",
                 "<a/> !1/9@1: Document Type Declaration not at start of document ERROR"},
        Document{"nor a second one", "<!DOCTYPE a><!DOCTYPE a><a/>",
                 " !1/9@1: Document Type Declaration already read ERROR"}));

TEST(ScannerLines, CountWhatWasReadAndAFeedBehindANameTwice) {
    EXPECT_EQ(events("<a>\n\n</>"), "<a> ERROR");
    EXPECT_EQ(events("<a>\n\n</a b>"), "<a> !1/23@3: XML not Well-Formed ERROR");
    // Intended: the character behind a name is pushed back, and a line feed that is read again counts twice.
    EXPECT_EQ(events("<a\n>\n</a b>"), "<a> !1/23@4: XML not Well-Formed ERROR");
    EXPECT_EQ(events("<a b='1'\n\r\n>\n</a b>"), "<a b=[1]> !1/23@4: XML not Well-Formed ERROR");
}

struct ModeCase {
    const char* text;
    eqbx_whitespace mode;
    const char* outcome;
};
void PrintTo(const ModeCase& c, std::ostream* os) { *os << c.text << " mode " << c.mode; }

class ElementValue : public testing::TestWithParam<ModeCase> {};
TEST_P(ElementValue, FollowsTheWhiteSpaceMode) {
    EXPECT_EQ(value(GetParam().text, GetParam().mode), GetParam().outcome);
}

INSTANTIATE_TEST_SUITE_P(
    Modes, ElementValue,
    testing::Values(ModeCase{"<a> x  y </a>", EQBX_WS_COLLAPSE, "'x y' end"},
                    ModeCase{"<a> x  y </a>", EQBX_WS_REPLACE, "' x  y ' end"},
                    ModeCase{"<a>\tx\r\ny\n</a>", EQBX_WS_REPLACE, "' x y ' end"},
                    ModeCase{"<a>\tx\r\ny\n</a>", EQBX_WS_PRESERVE, "'\\x09x\\x0Ay\\x0A' end"},
                    ModeCase{"<a>\tx\r\n \v\fy\n</a>", EQBX_WS_COLLAPSE, "'x y' end"},
                    ModeCase{"<a></a>", EQBX_WS_COLLAPSE, "'' end"},
                    ModeCase{"<a> \n </a>", EQBX_WS_COLLAPSE, "'' end"},
                    ModeCase{"<a>x<!-- c --> <?pi?>y</a>", EQBX_WS_COLLAPSE, "'x y' end"},
                    ModeCase{"<a> &#32;x&#9;&#32;y</a>", EQBX_WS_COLLAPSE, "'x y' end"},
                    ModeCase{"<a>&#9;x&#10;</a>", EQBX_WS_REPLACE, "' x ' end"},
                    ModeCase{"<a>&#9;x&#10;</a>", EQBX_WS_PRESERVE, "'\\x09x\\x0A' end"},
                    ModeCase{"<a>\xC3\xA9  \xE2\x82\xAC \xF0\x9F\x98\x80</a>", EQBX_WS_COLLAPSE,
                             "'\\xC3\\xA9 \\xE2\\x82\\xAC \\xF0\\x9F\\x98\\x80' end"},
                    ModeCase{"<a>1</a >", EQBX_WS_COLLAPSE, "'1' end"},
                    ModeCase{"<a>x</a>", static_cast<eqbx_whitespace>(7), "'' end"}));

// Intended: a CDATA section is copied past the mode, and a pending space neither comes out before it nor goes
// away.
TEST(ElementValueCdata, PassesTheModeBy) {
    EXPECT_EQ(value("<a>x <![CDATA[  y  ]]>z</a>", EQBX_WS_COLLAPSE), "'x  y   z' end");
    EXPECT_EQ(value("<a><![CDATA[\t]]></a>", EQBX_WS_REPLACE), "'\\x09' end");
}

INSTANTIATE_TEST_SUITE_P(
    Failures, ElementValue,
    testing::Values(
        ModeCase{"<a>1", EQBX_WS_COLLAPSE, " !1/34@1: Premature end of file encountered FAIL"},
        ModeCase{"<a>1<b/></a>", EQBX_WS_COLLAPSE, "'1' NO END"},
        ModeCase{"<a>1</b>", EQBX_WS_COLLAPSE, "'1' NO END"},
        ModeCase{"<a>1</ab>", EQBX_WS_COLLAPSE, "'1' NO END"},
        ModeCase{"<a>1</a", EQBX_WS_COLLAPSE, "'1' NO END"},
        ModeCase{"<a>1<", EQBX_WS_COLLAPSE, "'1' NO END"},
        ModeCase{"<a>1<!x></a>", EQBX_WS_COLLAPSE, " !1/23@1: XML not well-formed FAIL"},
        ModeCase{"<a>1<!-x></a>", EQBX_WS_COLLAPSE, " !1/23@1: XML not well-formed FAIL"},
        ModeCase{"<a>1<![CDATX[x]]></a>", EQBX_WS_COLLAPSE, " !1/23@1: XML not well-formed FAIL"},
        ModeCase{"<a>1<!-- x", EQBX_WS_COLLAPSE, " !1/34@1: Premature end of file encountered FAIL"},
        ModeCase{"<a>1<?x", EQBX_WS_COLLAPSE, " !1/34@1: Premature end of file encountered FAIL"},
        ModeCase{"<a>1&u;</a>", EQBX_WS_COLLAPSE, "FAIL"}, ModeCase{"<a>1&#;</a>", EQBX_WS_COLLAPSE, "FAIL"},
        ModeCase{"<a>1\x80</a>", EQBX_WS_COLLAPSE, " !1/34@1: Premature end of file encountered FAIL"}));

TEST(ElementValueEntities, StayAsTheyAreWhenTheyAreNotToBeExpanded) {
    EXPECT_EQ(value("<a>1 &amp; &u; &</a>", EQBX_WS_COLLAPSE, false), "'1 &amp; &u; &' end");
}

TEST(ScannerEvents, KnowTheirErrors) {
    for (int event = -1; event < 20; ++event) {
        EXPECT_EQ(c_xml::is_error_event(event), event == 2 || event == 3) << event;
    }
}

TEST(ScannerNames, AreCutAtTheFirstColon) {
    std::string out;
    EXPECT_EQ(c_xml::get_local_name("a:b:c", &out), "b:c");
    EXPECT_EQ(&c_xml::get_local_name("a", &out), &out);
    EXPECT_EQ(out, "a");
    EXPECT_EQ(c_xml::get_namespace_prefix("a:b:c", &out), "a");
    EXPECT_EQ(c_xml::get_namespace_prefix("a", &out), "");
    std::string name = "p:x";
    EXPECT_EQ(c_xml::get_local_name(name, &name), "x");
    name = "p:x";
    EXPECT_EQ(c_xml::get_namespace_prefix(name, &name), "p");
    name = "x";
    EXPECT_EQ(c_xml::get_namespace_prefix(name, &name), "");
}

/// The event that follows a first one, which is an error.
std::string behind_an_error(const std::string& document) {
    return reading_paths::on_all_paths(document, [](c_read& source, bool use_runs) {
        std::string log;
        reading_paths::RecordingErrors errors(&log);
        c_xml xml(source, errors, true);
        xml.use_runs(use_runs);
        c_xml_local scope;
        std::string name;
        EXPECT_EQ(xml.get_element_name(&scope, &name), EQXP_ERROR);
        const eqxp_xml_event next = xml.get_element_name(&scope, &name);
        return reading_paths::join({std::to_string(next), " ", name, log});
    });
}

TEST(ScannerErrors, ThatAreNotFatalLeaveTheInputBehindTheFault) {
    EXPECT_EQ(behind_an_error("<1 a='>'><b/>"), "7 b !1/23@1: XML not Well-Formed");
    EXPECT_EQ(behind_an_error("</a b><c/>"), "5 > !1/23@1: XML not Well-Formed");
    EXPECT_EQ(behind_an_error("<!ELEMENT a '>'><b/>"), "7 b");
    EXPECT_EQ(behind_an_error("</><b/>"), "7 b");
    EXPECT_EQ(behind_an_error(" &u;<b/>"), "7 b");
}

// Intended: some errors count as the first event of the document, others don't.
TEST(ScannerErrors, EndTheProlog) {
    const std::string declaration = "<?xml version='1.0'?><b/>";
    const std::string too_late = " !0/13@1: XML declaration not at start of document";
    EXPECT_EQ(behind_an_error("<!x>" + declaration), "3 " + too_late);
    EXPECT_EQ(behind_an_error("<![CDAT[" + declaration), "3  !1/23@1: XML not Well-Formed" + too_late);
    EXPECT_EQ(behind_an_error("</>" + declaration), "7 b");
    EXPECT_EQ(behind_an_error(" &u;" + declaration), "7 b");
    EXPECT_EQ(behind_an_error("<?xml version='1.0'>" + declaration), "7 b");
}

// Intended: what stands between tags follows the mode that was set last.
TEST(ScannerText, FollowsTheModeOfTheValueBefore) {
    const std::string document = "<a b='1'>x \n y<c/>&#32;z</a>";
    for (const bool collapsed : {false, true}) {
        const std::string texts =
            reading_paths::on_all_paths(document, [collapsed](c_read& source, bool use_runs) {
                c_error errors;
                c_xml xml(source, errors, true);
                xml.use_runs(use_runs);
                c_xml_local scope;
                std::string name;
                xml.get_element_name(&scope, &name);
                xml.get_attribute_name(&name, false);
                xml.get_attribute_value(&name, collapsed ? EQBX_WS_COLLAPSE : EQBX_WS_PRESERVE);
                xml.skip_start_tag(nullptr);
                EXPECT_EQ(xml.get_element_name(&scope, &name), EQXP_TEXT);
                std::string all = name;
                EXPECT_EQ(xml.get_element_name(&scope, &name), EQXP_NAME);
                xml.skip_start_tag(nullptr);
                EXPECT_EQ(xml.get_element_name(&scope, &name), EQXP_TEXT);
                return reading_paths::join({all, "|", name});
            });
        EXPECT_EQ(texts, collapsed ? "x y|z" : "x \n y| z");
    }
}

TEST(ScannerRewind, LeavesTheAttributesThatWereReadAhead) {
    const std::string text = "<a b='1' c='2'/>";
    c_read_string source(text);
    c_error errors;
    c_xml xml(source, errors, true);
    c_xml_local scope;
    std::string name;
    xml.get_element_name(&scope, &name);
    xml.get_attribute_name(&name, false);
    xml.skip_attribute_value();
    xml.rewind();
    EXPECT_EQ(xml.get_attribute_name(&name, false), EQXP_NAME);
    EXPECT_EQ(name, "c");
}

TEST(ScannerRewind, ForgetsNamespacesAndEntitiesAndThePhaseOfTheDocument) {
    const std::string text = "<?xml version='1.0'?><!DOCTYPE a [<!ENTITY e 'x'>]><a xmlns:p='u'>&e;&f;</a>";
    c_read_string source(text);
    c_error errors;
    c_xml xml(source, errors, true);
    c_xml_local scope;
    std::string name;
    for (int i = 0; i < 2; ++i) {
        ASSERT_EQ(xml.get_element_name(&scope, &name), EQXP_NAME);
        EXPECT_EQ(xml.find_enumerated_namespace("u"), 1000);
        bool is_empty = false;
        ASSERT_TRUE(xml.skip_start_tag(&is_empty));
        EXPECT_EQ(xml.get_element_name(&scope, &name), EQXP_ERROR);
        EXPECT_EQ(name, "x&f;");
        xml.rewind();
        EXPECT_EQ(xml.find_enumerated_namespace("u"), 0);
        EXPECT_EQ(xml.get_line_num(), 1);
    }
    EXPECT_FALSE(errors.is_errored());
}

TEST(ScannerFatal, EndsTheInputForEveryLaterCall) {
    const std::string text = "<a/><?xml version='1.0'?><b>1</b>";
    c_read_string source(text);
    c_error errors;
    c_xml xml(source, errors, true);
    c_xml_local scope;
    std::string name;
    xml.get_element_name(&scope, &name);
    xml.get_attribute_name(&name, false);
    EXPECT_EQ(xml.get_element_name(&scope, &name), EQXP_ERROR);
    EXPECT_EQ(xml.get_element_name(&scope, &name), EQXP_END_OF_MESSAGE);
    EXPECT_EQ(xml.get_attribute_name(&name, false), EQXP_ERROR);
    EXPECT_FALSE(xml.get_element_value(&name, EQBX_WS_COLLAPSE, true));
    EXPECT_FALSE(xml.is_element_end_tag("b"));
    EXPECT_FALSE(xml.skip_element_body("b"));
    EXPECT_FALSE(xml.get_any_element("b", &name, EQBX_WS_PRESERVE, false));
    xml.rewind();
    EXPECT_EQ(xml.get_element_name(&scope, &name), EQXP_END_OF_MESSAGE);
    EXPECT_EQ(errors.get_last_error(), EQBX_BAD_XML_DECL);
}

}  // namespace
