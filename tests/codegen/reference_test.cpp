#include <gtest/gtest.h>

#include <fstream>
#include <map>
#include <ostream>
#include <regex>
#include <set>
#include <sstream>
#include <string>

#include "codegen/emit.h"
#include "codegen/reference_words.h"
#include "codegen/schema_reader.h"
#include "tests/codegen/small_schema.h"

namespace {

using codegen_tests::read;
using vrl_codegen::anchor_of;
using vrl_codegen::element_declaration;
using vrl_codegen::facets;
using vrl_codegen::make_plan;
using vrl_codegen::plain;
using vrl_codegen::plan;
using vrl_codegen::plan_reference;
using vrl_codegen::read_schema;
using vrl_codegen::reference_module;
using vrl_codegen::reference_type;
using vrl_codegen::schema;
using vrl_codegen::words_of_occurrence;
using vrl_codegen::words_of_values;

// Words.

struct words_case {
    facets limits;
    const char* words;
};

void PrintTo(const words_case& c, std::ostream* os) { *os << "'" << c.words << "'"; }

class WordsOfValues : public testing::TestWithParam<words_case> {};

TEST_P(WordsOfValues, TellWhatFacetsAdmit) {
    EXPECT_EQ(words_of_values(GetParam().limits), GetParam().words);
}

facets range(const char* low, const char* above, const char* high, const char* below) {
    facets made;
    if (low != nullptr) made.min_inclusive = low;
    if (above != nullptr) made.min_exclusive = above;
    if (high != nullptr) made.max_inclusive = high;
    if (below != nullptr) made.max_exclusive = below;
    return made;
}

facets length(unsigned low, unsigned high) {
    facets made;
    if (low != 0) made.min_length = low;
    if (high != 0) made.max_length = high;
    return made;
}

facets literals() {
    facets made;
    made.enumeration = {"One", "Two"};
    return made;
}

const words_case k_words[] = {
    {{}, ""},
    {range("0.0", nullptr, "100.0", nullptr), "0 to 100"},
    {range("-0.5", nullptr, nullptr, nullptr), "-0.5 or more"},
    {range(nullptr, "0", nullptr, nullptr), "above 0"},
    {range(nullptr, nullptr, "10.50", nullptr), "at most 10.50"},
    {range(nullptr, nullptr, nullptr, "360.0"), "below 360"},
    {range("0.0", nullptr, nullptr, "360.0"), "0 or more, below 360"},
    {range(nullptr, "0.0", "1.0", nullptr), "above 0, at most 1"},
    {range(nullptr, "0.0", nullptr, "1.0"), "above 0, below 1"},
    {length(1, 0), "at least 1 character"},
    {length(0, 8), "at most 8 characters"},
    {length(2, 8), "2 to 8 characters"},
    {length(1, 1), "exactly 1 character"},
    {literals(), "one of `One`, `Two`"},
};
INSTANTIATE_TEST_SUITE_P(Facets, WordsOfValues, testing::ValuesIn(k_words));

TEST(WordsOfOccurrence, CountFromTheMinimumToTheMaximum) {
    element_declaration element;
    EXPECT_EQ(words_of_occurrence(element), "1");
    element.repeated = true;
    EXPECT_EQ(words_of_occurrence(element), "1..n");
    element.min_occurs = 0;
    EXPECT_EQ(words_of_occurrence(element), "0..n");
    element.repeated = false;
    EXPECT_EQ(words_of_occurrence(element), "0..1");
}

TEST(PlainText, StaysAsItIsInMarkdown) {
    EXPECT_EQ(plain("L*a*b* | <a> `b` \\ c_d"), "L\\*a\\*b\\* \\| \\<a\\> \\`b\\` \\\\ c_d");
}

TEST(Anchors, AreThoseThatMarkdownGivesToHeadings) {
    EXPECT_EQ(anchor_of("Group ColorSpace"), "group-colorspace");
    EXPECT_EQ(anchor_of("OwnerType/Person"), "ownertypeperson");
    EXPECT_EQ(anchor_of("Elements of color_space"), "elements-of-color_space");
}

// Pages of a small schema, whole.

const char k_small[] = R"(
<xs:annotation><xs:documentation>Things to sit on.</xs:documentation></xs:annotation>
<xs:simpleType name="Height"><xs:annotation><xs:documentation>A height in metres.</xs:documentation></xs:annotation>
  <xs:restriction base="xs:double"><xs:minExclusive value="0.0"/></xs:restriction></xs:simpleType>
<xs:simpleType name="Wood"><xs:annotation><xs:documentation>A kind of wood.</xs:documentation></xs:annotation>
  <xs:restriction base="xs:string"><xs:enumeration value="Oak"/><xs:enumeration value="Ash"/></xs:restriction></xs:simpleType>
<xs:complexType name="SeatType" abstract="true">
  <xs:annotation><xs:appinfo><b:polymorphic/></xs:appinfo><xs:documentation>What all seats have.</xs:documentation></xs:annotation>
  <xs:sequence><xs:element name="Height" type="v:Height"><xs:annotation><xs:appinfo><b:read-optional/></xs:appinfo></xs:annotation></xs:element>
  <xs:element name="Leg" minOccurs="0" maxOccurs="unbounded" nillable="true"><xs:complexType>
    <xs:simpleContent><xs:extension base="v:Wood"/></xs:simpleContent></xs:complexType></xs:element></xs:sequence>
  <xs:attribute name="Places" default="1"><xs:simpleType><xs:restriction base="xs:int"><xs:minInclusive value="1"/></xs:restriction></xs:simpleType></xs:attribute>
</xs:complexType>
<xs:complexType name="BenchType"><xs:complexContent><xs:extension base="v:SeatType"/></xs:complexContent></xs:complexType>
<xs:complexType name="RoomType"><xs:choice><xs:element name="Bench" type="v:BenchType"/><xs:element name="Note" type="xs:string"/></xs:choice></xs:complexType>
<xs:complexType name="HallType"><xs:sequence><xs:element ref="v:Seat" maxOccurs="unbounded"/></xs:sequence></xs:complexType>
<xs:element name="Seat" type="v:SeatType" abstract="true"/>
<xs:element name="Bench" type="v:BenchType" substitutionGroup="v:Seat">
  <xs:annotation><xs:documentation>A long seat.</xs:documentation></xs:annotation></xs:element>
)";

std::string between(const std::string& text, const std::string& from, const std::string& to) {
    const std::size_t first = text.find(from);
    if (first == std::string::npos) return "no " + from;
    return text.substr(first, text.find(to, first + from.size()) - first);
}

class SmallReference : public testing::Test {
protected:
    std::string section(const std::string& title) const {
        return between(m_text, "### " + title + "\n", "\n##");
    }

    const schema m_source = read(k_small);
    const plan m_model = make_plan(m_source);
    const std::string m_text = emit_reference(plan_reference(m_source, m_model)) + "\n##";
};

TEST_F(SmallReference, ModulesAreListedWithTheirSubject) {
    EXPECT_NE(m_text.find("| [small](#module-small) | Things to sit on. |\n"), std::string::npos);
    EXPECT_NE(m_text.find("## Module small\n\nThings to sit on.\n"), std::string::npos);
}

TEST_F(SmallReference, ElementsTellTypeAndGroup) {
    EXPECT_EQ(section("Elements of small"), R"(### Elements of small

| Element | Type | Meaning | Remarks | Used in |
|---|---|---|---|---|
| `Seat` | [SeatType](#seattype) | What all seats have. | never occurs itself, [head of a group](#group-seat) | [HallType](#halltype) |
| `Bench` | [BenchType](#benchtype) | A long seat. | [in group Seat](#group-seat) |  |
)");
}

TEST_F(SmallReference, GroupsNumberTheirMembers) {
    EXPECT_EQ(section("Group Seat"), R"(### Group Seat

Wherever a type refers to `Seat`, one of these elements stands.

| Number | Element | Type |
|---|---|---|
| 0 | `Bench` | [BenchType](#benchtype) |

Used in [HallType](#halltype).
)");
}

TEST_F(SmallReference, TypesTellAttributesAndChildren) {
    EXPECT_EQ(section("SeatType"), R"(### SeatType

What all seats have.

Abstract: a derived type takes its place.

| Attribute | Type | Occurs | Values |
|---|---|---|---|
| `Places` | whole number | optional; `1` if absent | 1 or more |

| Child | Type | Occurs | Values | Meaning |
|---|---|---|---|---|
| `Height` | number | 1; reading accepts its absence | [Height](#height) | A height in metres. |
| `Leg` | [SeatType/Leg](#seattypeleg) | 0..n; may be nil |  |  |

Extended by [BenchType](#benchtype).

Used in element `Seat`.
)");
}

TEST_F(SmallReference, ATypeInsideAnotherFollowsItAndTellsItsClass) {
    EXPECT_EQ(section("SeatType/Leg"), R"(### SeatType/Leg

Text: text; [Wood](#wood).

Class: `Leg`.
)");
    EXPECT_LT(m_text.find("### SeatType\n"), m_text.find("### SeatType/Leg\n"));
    EXPECT_LT(m_text.find("### SeatType/Leg\n"), m_text.find("### BenchType\n"));
}

TEST_F(SmallReference, DerivedTypesTellTheirBaseAndUses) {
    EXPECT_EQ(section("BenchType"), R"(### BenchType

Extends [SeatType](#seattype): what stands there comes first.

Used in [RoomType](#roomtype) as `Bench`, element `Bench`.
)");
}

TEST_F(SmallReference, ChoicesLeaveOutWhatNoOptionHas) {
    EXPECT_EQ(section("RoomType"), R"(### RoomType

| One of | Type |
|---|---|
| `Bench` | [BenchType](#benchtype) |
| `Note` | text |
)");
}

TEST_F(SmallReference, SimpleTypesTellTheirValues) {
    EXPECT_EQ(section("Height"), "### Height\n\nA height in metres.\n\nValues: number, above 0.\n");
    EXPECT_EQ(section("Wood"), "### Wood\n\nA kind of wood.\n\n1. `Oak`\n2. `Ash`\n");
}

// The reference of the format.

class FormatReference : public testing::Test {
protected:
    std::set<std::string> all(const std::string& pattern) const {
        const std::regex form(pattern);
        std::set<std::string> found;
        for (std::sregex_iterator match(m_text.begin(), m_text.end(), form), end; match != end; ++match) {
            found.insert((*match)[1]);
        }
        return found;
    }

    const schema m_source = read_schema(VRL_SCHEMA "/vrl.xsd");
    const plan m_model = make_plan(m_source);
    const std::string m_text = emit_reference(plan_reference(m_source, m_model));
};

TEST_F(FormatReference, IsTheOneInDocs) {
    std::ifstream file(VRL_DOCS "/format.md", std::ios::binary);
    std::ostringstream committed;
    committed << file.rdbuf();
    EXPECT_TRUE(committed.str() == m_text)
        << "Run vrl_codegen schema/vrl.xsd --reference docs/format.md and review the difference.";
}

TEST_F(FormatReference, HeadingsHaveAnchorsOfTheirOwn) {
    std::map<std::string, int> anchors;
    std::istringstream lines(m_text);
    for (std::string line; std::getline(lines, line);) {
        if (line.rfind("##", 0) == 0) ++anchors[anchor_of(line.substr(line.find(' ') + 1))];
    }
    EXPECT_GT(anchors.size(), 150u);
    for (const auto& [anchor, count] : anchors) EXPECT_EQ(count, 1) << anchor;
}

TEST_F(FormatReference, EveryLinkLeadsToAHeading) {
    std::set<std::string> anchors;
    std::istringstream lines(m_text);
    for (std::string line; std::getline(lines, line);) {
        if (line.rfind("##", 0) == 0) anchors.insert(anchor_of(line.substr(line.find(' ') + 1)));
    }
    const std::set<std::string> links = all("\\]\\(#([^)]*)\\)");
    EXPECT_GT(links.size(), 100u);
    for (const std::string& link : links) EXPECT_EQ(anchors.count(link), 1u) << link;
}

TEST_F(FormatReference, NamesEveryDeclarationOfTheSchema) {
    const std::set<std::string> named = all("\\| `([A-Za-z0-9_]+)` \\|");
    for (const auto& element : m_source.elements) EXPECT_EQ(named.count(element.name), 1u) << element.name;
    for (const auto& type : m_source.types) {
        for (const auto& attribute : type.attributes)
            EXPECT_EQ(named.count(attribute.name), 1u) << attribute.name;
        for (const auto& element : type.elements) {
            if (element.kind == element_declaration::form::any) continue;
            EXPECT_EQ(named.count(element.name), 1u) << element.name;
        }
    }
    for (const auto& type : m_source.simple_types) {
        EXPECT_NE(m_text.find("### " + type.name + "\n"), std::string::npos) << type.name;
    }
}

TEST_F(FormatReference, EveryTypeAndRowTellsWhatItMeans) {
    for (const reference_module& module : plan_reference(m_source, m_model).modules) {
        EXPECT_NE(module.meaning, "") << module.name;
        for (const auto& element : module.elements) EXPECT_NE(element.meaning, "") << element.name;
        for (const auto& type : module.simple_types) EXPECT_NE(type.meaning, "") << type.title;
        for (const reference_type& type : module.types) {
            EXPECT_NE(type.meaning, "") << type.title;
            for (const auto& row : type.attributes)
                EXPECT_NE(row.meaning, "") << type.title << " " << row.name;
            for (const auto& row : type.children) {
                // What elements of any name mean, the type that holds them tells.
                EXPECT_EQ(row.meaning.empty(), row.name == "any element") << type.title << " " << row.name;
            }
        }
    }
}

}  // namespace
