#include "runtime/references.h"

#include <gtest/gtest.h>

#include "runtime/scanner.h"
#include "scan_trace.h"

namespace {

using namespace qbxV2;
using scan_trace::attribute;
using scan_trace::events;
using scan_trace::value;

struct Reference {
    const char* why;
    std::string reference;
    std::string text;
};
void PrintTo(const Reference& r, std::ostream* os) { *os << r.why << ": " << r.reference; }

std::string element(const std::string& content) { return std::string("<a>").append(content).append("</a>"); }
std::string tag(const std::string& content) { return std::string("<a b='").append(content).append("'/>"); }
std::string in_quotes(const std::string& text) { return std::string("'").append(text).append("' end"); }
std::string in_brackets(const std::string& text) { return std::string("[").append(text).append("]"); }

class GoodReference : public testing::TestWithParam<Reference> {};

TEST_P(GoodReference, GivesItsTextInContentAndInAttributes) {
    EXPECT_EQ(value(element(GetParam().reference)), in_quotes(GetParam().text));
    EXPECT_EQ(attribute(tag(GetParam().reference)), in_brackets(GetParam().text));
}

INSTANTIATE_TEST_SUITE_P(Predefined, GoodReference,
                         testing::Values(Reference{"less than", "&lt;", "<"},
                                         Reference{"greater than", "&gt;", ">"},
                                         Reference{"ampersand", "&amp;", "&"},
                                         Reference{"apostrophe", "&apos;", "'"},
                                         Reference{"quotation mark", "&quot;", "\""},
                                         Reference{"without ; the next character stays", "&lt x", "< x"},
                                         Reference{"without ; at the end", "x&lt", "x<"},
                                         Reference{"two without ;", "&lt&gt", "<>"}));

INSTANTIATE_TEST_SUITE_P(
    Characters, GoodReference,
    testing::Values(Reference{"decimal", "&#65;", "A"}, Reference{"hexadecimal", "&#x41;", "A"},
                    Reference{"hexadecimal letters", "&#x4a;&#x4A;", "JJ"},
                    Reference{"without ;", "&#65 x", "A x"},
                    Reference{"a hexadecimal one ends at the first other character", "&#x41g", "Ag"},
                    Reference{"leading zeros", "&#00000000000000000065;", "A"},
                    Reference{"two bytes", "&#233;", "\\xC3\\xA9"},
                    Reference{"three bytes", "&#x20AC;", "\\xE2\\x82\\xAC"},
                    Reference{"four bytes", "&#x1F600;", "\\xF0\\x9F\\x98\\x80"},
                    Reference{"the last one", "&#x100000;", "\\xF4\\x80\\x80\\x80"},
                    Reference{"next line becomes a line feed", "&#x85;&#133;", "\\x0A\\x0A"},
                    Reference{"line separator becomes a line feed", "&#x2028;&#8232;", "\\x0A\\x0A"},
                    Reference{"a carriage return stays one", "&#13;", "\\x0D"},
                    Reference{"NUL is a character", "&#0;", "\\x00"}, Reference{"DEL", "&#127;", "\\x7F"},
                    Reference{"the first of two bytes", "&#128;", "\\xC2\\x80"},
                    Reference{"a surrogate", "&#xD800;", "\\xED\\xA0\\x80"}));

class BadReference : public testing::TestWithParam<Reference> {};

TEST_P(BadReference, FailsTheRead) {
    EXPECT_EQ(value(element(GetParam().reference)), "FAIL");
    EXPECT_EQ(attribute(tag(GetParam().reference)), in_brackets(GetParam().text).append(" FAIL"));
    EXPECT_EQ(events(element(GetParam().reference)), "<a> ERROR");
}

INSTANTIATE_TEST_SUITE_P(
    Cases, BadReference,
    testing::Values(Reference{"a capital X", "&#X41;", ""}, Reference{"no digits", "&#;", ""},
                    Reference{"no hexadecimal digits", "&#x;", ""}, Reference{"a letter", "&#a;", ""},
                    Reference{"one too many", "&#x100001;", ""},
                    Reference{"one too many, decimal", "&#1048577;", ""},
                    Reference{"the last plane's end", "&#x10FFFF;", ""},
                    Reference{"beyond 32 bits, which would come round to A", "&#4294967361;", ""},
                    Reference{"beyond 32 bits, hexadecimal", "&#x100000041;", ""},
                    Reference{"beyond 64 bits", "&#x10000000000000041;", ""},
                    Reference{"an unknown entity stands as it was written", "&unknown;", "&unknown;"},
                    Reference{"an unknown entity without ;", "&unknown", "&unknown"},
                    Reference{"no name", "&;", "&;"}, Reference{"a bare ampersand", "& ", "&"},
                    Reference{"names are case-sensitive", "&LT;", "&LT;"}));

std::string with_entities(const std::string& entities, const std::string& body) {
    return std::string("<!DOCTYPE a [").append(entities).append("]>").append(body);
}

TEST(GeneralEntity, GivesItsTextInContentAndInAttributes) {
    EXPECT_EQ(events(with_entities("<!ENTITY e 'x'>", "<a b='1&e;2'>&e;</a>")), "<a b=[1x2]> 'x' </a> EOF");
    EXPECT_EQ(events(with_entities("<!ENTITY e 'x'>", "<a>1&e;2&e</a>")), "<a> '1x2x' </a> EOF");
}

TEST(GeneralEntity, InContentItsMarkupCounts) {
    EXPECT_EQ(events(with_entities("<!ENTITY e '<b c=\"1\">x</b><d/>'>", "<a>&e;</a>")),
              "<a> <b c=[1]> 'x' </b> <d/> </a> EOF");
    EXPECT_EQ(events(with_entities("<!ENTITY e '</a><'>", "<a>&e;b/>")), "<a> </a> <b/> EOF");
}

TEST(GeneralEntity, AnEmptyOneIsNothing) {
    EXPECT_EQ(events(with_entities("<!ENTITY e ''>", "<a b='&e;'>&e;</a>")), "<a b=[]> </a> EOF");
    EXPECT_EQ(value(with_entities("<!ENTITY e ''>", "<a>1&e;2</a>")), "'12' end");
}

TEST(GeneralEntity, NestedOnesAreReadThroughInContent) {
    EXPECT_EQ(value(with_entities("<!ENTITY e '1&f;2&f;3'><!ENTITY f '(&g;)'><!ENTITY g 'x'>", "<a>&e;</a>")),
              "'1(x)2(x)3' end");
}

// Intended: on the way into an attribute value the character right behind a nested reference is dropped.
TEST(GeneralEntity, BehindANestedReferenceInAnAttributeOneCharacterIsDropped) {
    EXPECT_EQ(attribute(with_entities("<!ENTITY e '1&f;23&lt;45'><!ENTITY f 'x'>", "<a b='&e;8'/>")),
              "[1x3<58]");
    EXPECT_EQ(attribute(with_entities("<!ENTITY e '&f;2&f;3'><!ENTITY f '&g;4&g;'><!ENTITY g 'x'>",
                                      "<a b='&e;'/>")),
              "[xxxx]");
}

TEST(GeneralEntity, ANestedReferenceAtTheVeryEndIsTheEnd) {
    EXPECT_EQ(attribute(with_entities("<!ENTITY e '1&f;'><!ENTITY f 'x'>", "<a b='&e;2'/>")), "[1x2]");
    EXPECT_EQ(attribute(with_entities("<!ENTITY e '1&f'><!ENTITY f 'x'>", "<a b='&e;2'/>")), "[1x2]");
    EXPECT_EQ(attribute(with_entities("<!ENTITY e '1&lt'>", "<a b='&e;2'/>")), "[1<2]");
}

// Intended: on that way a percent sign begins a reference to a general entity too.
TEST(GeneralEntity, APercentSignInItsTextBeginsAReferenceInAnAttribute) {
    EXPECT_EQ(attribute(with_entities("<!ENTITY e '1&#37;f;23'><!ENTITY f 'x'>", "<a b='&e;'/>")), "[1x3]");
    EXPECT_EQ(attribute(with_entities("<!ENTITY e '100&#37;'>", "<a b='&e;'/>")), "[100&] FAIL");
    EXPECT_EQ(value(with_entities("<!ENTITY e '100&#37;'>", "<a>&e;</a>")), "'100%' end");
}

TEST(GeneralEntity, AnUnknownOneWithinFails) {
    EXPECT_EQ(attribute(with_entities("<!ENTITY e '1&u;2'>", "<a b='0&e;3'/>")), "[01&u;] FAIL");
    EXPECT_EQ(value(with_entities("<!ENTITY e '1&u;2'>", "<a>&e;</a>")), "FAIL");
}

TEST(GeneralEntity, TheTextFollowsTheWhiteSpaceMode) {
    const std::string entity = "<!ENTITY e ' x\n '>";
    EXPECT_EQ(value(with_entities(entity, "<a> &e; y</a>"), EQBX_WS_COLLAPSE), "'x y' end");
    EXPECT_EQ(attribute(with_entities(entity, "<a b=' &e; y'/>"), EQBX_WS_COLLAPSE), "[x y]");
    EXPECT_EQ(attribute(with_entities(entity, "<a b='&e;'/>"), EQBX_WS_REPLACE), "[ x  ]");
}

// Intended: what comes from these references is appended past the white-space mode.
TEST(PredefinedEntity, PassesTheModeByAndAPendingSpaceComesOutBehindIt) {
    EXPECT_EQ(value("<a>1 &lt; 2</a>", EQBX_WS_COLLAPSE), "'1< 2' end");
    EXPECT_EQ(attribute("<a b='1 &lt; 2'/>", EQBX_WS_COLLAPSE), "[1< 2]");
    EXPECT_EQ(value("<a>1 &#65; 2</a>", EQBX_WS_COLLAPSE), "'1 A 2' end") << "a reference to ASCII does not";
}

TEST(PredefinedEntity, CannotBeRedefined) {
    EXPECT_EQ(events(with_entities("<!ENTITY lt 'x'>", "<a b='&lt;'>&lt;</a>")), "<a b=[<]> '<' </a> EOF");
}

TEST(CharacterReference, From128OnPassesTheModeByToo) {
    EXPECT_EQ(value("<a>1 &#233; 2</a>", EQBX_WS_COLLAPSE), "'1\\xC3\\xA9 2' end");
    EXPECT_EQ(value("<a>1&#x2028;2</a>", EQBX_WS_COLLAPSE), "'1 2' end") << "a line end does not";
}

TEST(GeneralEntity, ItsTextKeepsBytesFrom0x80) {
    const std::string entity = "<!ENTITY e '\xC3\xA9'>";
    EXPECT_EQ(value(with_entities(entity, "<a>&e;</a>")), "'\\xC3\\xA9' end");
    EXPECT_EQ(attribute(with_entities(entity, "<a b='&e;'/>")), "[\\xC3\\xA9]");
}

TEST(GeneralEntity, NamesMayHoldBytesFrom0x80) {
    EXPECT_EQ(events(with_entities("<!ENTITY \xC3\xA9 'x'>", "<a b='&\xC3\xA9;'>&\xC3\xA9;</a>")),
              "<a b=[x]> 'x' </a> EOF");
}

// Intended: bytes from 0x80 are negative in entity text, and no negative value is a name character.
TEST(GeneralEntity, InItsTextANameEndsAtBytesFrom0x80) {
    EXPECT_EQ(value(with_entities("<!ENTITY e '&lt\xC3\xA9;'>", "<a>&e;</a>")), "'<\\xC3\\xA9;' end");
    EXPECT_EQ(events(with_entities("<!ENTITY e '<\xC3\xA9/>'>", "<a>&e;</a>")),
              "<a> !1/23@1: XML not Well-Formed ERROR");
}

constexpr char k_recursive[] = " !0/9@1: Recursive entity definition for: ";

std::string recursive(const char* before, const char* text, const char* behind) {
    return std::string(before).append(k_recursive).append(text).append(behind);
}

TEST(RecursiveEntity, IsFatalInContent) {
    EXPECT_EQ(events(with_entities("<!ENTITY a '&a;'>", "<a>&a;</a>")), recursive("<a>", "&a;", " EOF"));
    EXPECT_EQ(events(with_entities("<!ENTITY a 'x&a;y'>", "<a>&a;</a>")),
              recursive("<a>", "x&a;y", " 'x' EOF"));
    EXPECT_EQ(value(with_entities("<!ENTITY a '1&b;'><!ENTITY b '2&a;'>", "<a>&a;</a>")),
              recursive("", "1&b;", " FAIL"));
}

TEST(RecursiveEntity, IsFatalInAnAttribute) {
    EXPECT_EQ(attribute(with_entities("<!ENTITY a 'x&a;'>", "<a b='&a;'/>")),
              recursive("", "x&a;", " [x] FAIL"));
    EXPECT_EQ(attribute(with_entities("<!ENTITY a '1&b;'><!ENTITY b '2&a;'>", "<a b='&a;'/>")),
              recursive("", "1&b;", " [12] FAIL"));
}

TEST(RecursiveEntity, WithoutASemicolonItIsOneToo) {
    EXPECT_EQ(attribute(with_entities("<!ENTITY a '&a'>", "<a b='&a;'/>")), recursive("", "&a", " [] FAIL"));
    EXPECT_EQ(value(with_entities("<!ENTITY a '&a'>", "<a>&a;</a>")), recursive("", "&a", " FAIL"));
    EXPECT_EQ(value(with_entities("<!ENTITY a '1&b'><!ENTITY b '2&a'>", "<a>&a;</a>")),
              recursive("", "1&b", " FAIL"));
    EXPECT_EQ(attribute(with_entities("<!ENTITY a '1&b'><!ENTITY b '2&a'>", "<a b='&a;'/>")),
              recursive("", "1&b", " [12] FAIL"));
}

TEST(RecursiveEntity, OneThatEndedBeforeIsNone) {
    EXPECT_EQ(value(with_entities("<!ENTITY a '1&b'><!ENTITY b '2'>", "<a>&a;&b;&a&b&a;&lt;&a;</a>")),
              "'12212212<12' end");
}

TEST(RecursiveEntity, IsFatalInANamespaceDeclaration) {
    EXPECT_EQ(events(with_entities("<!ENTITY a '&a;'>", "<a xmlns='&a;'/>")), recursive("", "&a;", " ERROR"));
}

TEST(RecursiveEntity, EqualTextsAreDifferentEntities) {
    EXPECT_EQ(value(with_entities("<!ENTITY a '&b;'><!ENTITY b '&c;'><!ENTITY c '&lt;'>", "<a>&a;&a;</a>")),
              "'<<' end");
    EXPECT_EQ(
        attribute(with_entities("<!ENTITY a '&b;'><!ENTITY b '&c;'><!ENTITY c 'x'>", "<a b='&a;&a;'/>")),
        "[xx]");
}

TEST(ReferenceName, EndsAtTheFirstOtherCharacterWhichIsPushedBack) {
    const char* const text = "a.b-c_d:e1!";
    const char* cursor = text;
    c_entity_name_reader_for_entity reader(text, &cursor);
    std::string name = "previous";
    EXPECT_FALSE(detail::read_reference_name(reader, reader.get(), &name));
    EXPECT_EQ(name, "a.b-c_d:e1");
    EXPECT_STREQ(cursor, "!");
}

}  // namespace
