#include "codegen/schema_reader.h"

#include <gtest/gtest.h>

#include <ostream>
#include <string>

#include "codegen/xml_dom.h"
#include "tests/codegen/small_schema.h"

namespace {

using codegen_tests::around;
using codegen_tests::read;
using codegen_tests::refusal;
using codegen_tests::temporary_folder;
using vrl_codegen::attribute_declaration;
using vrl_codegen::complex_type;
using vrl_codegen::element_declaration;
using vrl_codegen::facets;
using vrl_codegen::global_element;
using vrl_codegen::has_note;
using vrl_codegen::schema;

struct refused_schema {
    const char* why;
    std::string declarations;
    std::string said;
};

void PrintTo(const refused_schema& c, std::ostream* os) { *os << c.why; }

class RefusedSchema : public testing::TestWithParam<refused_schema> {};

TEST_P(RefusedSchema, IsToldByPlaceAndReason) {
    EXPECT_EQ(refusal(GetParam().declarations), GetParam().said);
}

/// A complex type T, its content on line 3.
std::string type(const std::string& content) {
    return "<xs:complexType name=\"T\">\n" + content + "\n</xs:complexType>";
}

/// A sequence in T, its particles on line 3.
std::string sequence(const std::string& particles) {
    return type("<xs:sequence>" + particles + "</xs:sequence>");
}

const refused_schema k_unknown_constructs[] = {
    {"a name that XML Schema doesn't know", "\n<xs:complicatedType/>",
     "small.xsd:3: unknown construct complicatedType in schema"},
    {"a global attribute", R"(<xs:attribute name="a" type="xs:string"/>)",
     "small.xsd:2: unknown construct attribute in schema"},
    {"a group", R"(<xs:group name="g"><xs:sequence/></xs:group>)",
     "small.xsd:2: unknown construct group in schema"},
    {"a group of attributes", R"(<xs:attributeGroup name="g"/>)",
     "small.xsd:2: unknown construct attributeGroup in schema"},
    {"a notation", R"(<xs:notation name="n" public="p"/>)",
     "small.xsd:2: unknown construct notation in schema"},
    {"an import", R"(<xs:import namespace="urn:other"/>)", "small.xsd:2: unknown construct import in schema"},
    {"xs:all", type("<xs:all/>"), "small.xsd:3: unknown construct all in complexType"},
    {"a restriction of content",
     R"(<xs:complexType name="A"/>)" +
         type(R"(<xs:complexContent><xs:restriction base="v:A"/></xs:complexContent>)"),
     "small.xsd:3: unknown construct restriction in complexContent"},
    {"any attribute", type(R"(<xs:anyAttribute/>)"),
     "small.xsd:3: unknown construct anyAttribute in complexType"},
    {"a choice in a sequence", sequence("<xs:choice/>"), "small.xsd:3: unknown construct choice in sequence"},
    {"a sequence in a choice", type("<xs:choice><xs:sequence/></xs:choice>"),
     "small.xsd:3: unknown construct sequence in choice"},
    {"a reference in a choice",
     R"(<xs:element name="E" type="v:T"/>)" + type(R"(<xs:choice><xs:element ref="v:E"/></xs:choice>)"),
     "small.xsd:3: unknown attribute ref of element"},
    {"xs:any in a choice", type(R"(<xs:choice><xs:any processContents="skip"/></xs:choice>)"),
     "small.xsd:3: unknown construct any in choice"},
    {"a choice in an extension",
     R"(<xs:complexType name="A"/>)" +
         type(
             R"(<xs:complexContent><xs:extension base="v:A"><xs:choice/></xs:extension></xs:complexContent>)"),
     "small.xsd:3: unknown construct choice in extension"},
    {"a list", R"(<xs:simpleType name="S"><xs:list itemType="xs:int"/></xs:simpleType>)",
     "small.xsd:2: unknown construct list in simpleType"},
    {"a union", R"(<xs:simpleType name="S"><xs:union memberTypes="xs:int"/></xs:simpleType>)",
     "small.xsd:2: unknown construct union in simpleType"},
    {"a facet of digits",
     "<xs:simpleType name=\"S\"><xs:restriction base=\"xs:int\">\n"
     "<xs:totalDigits value=\"3\"/></xs:restriction></xs:simpleType>",
     "small.xsd:3: unknown construct totalDigits in restriction"},
    {"a key", R"(<xs:element name="E"><xs:complexType/>
<xs:key name="k"><xs:selector xpath="."/><xs:field xpath="."/></xs:key></xs:element>)",
     "small.xsd:3: unknown construct key in element"},
    {"a simple global element with its own type",
     R"(<xs:element name="E"><xs:simpleType><xs:restriction base="xs:int"/></xs:simpleType></xs:element>)",
     "small.xsd:2: unknown construct simpleType in element"},
    {"a global element of a built-in type", R"(<xs:element name="E" type="xs:int"/>)",
     "small.xsd:2: the global element E needs a complex type"},
    {"a global element without a type", R"(<xs:element name="E"/>)",
     "small.xsd:2: the global element E needs a complex type"},
    {"a local element without a type", sequence(R"(<xs:element name="E"/>)"), "small.xsd:3: E has no type"},
    {"an attribute without a type", type(R"(<xs:attribute name="a"/>)"), "small.xsd:3: a has no type"},
};
INSTANTIATE_TEST_SUITE_P(UnknownConstructs, RefusedSchema, testing::ValuesIn(k_unknown_constructs));

const refused_schema k_unknown_attributes[] = {
    {"mixed content", R"(<xs:complexType name="T" mixed="true"/>)",
     "small.xsd:2: unknown attribute mixed of complexType"},
    {"a final type", R"(<xs:complexType name="T" final="extension"/>)",
     "small.xsd:2: unknown attribute final of complexType"},
    {"a fixed attribute", type(R"(<xs:attribute name="a" type="xs:int" fixed="1"/>)"),
     "small.xsd:3: unknown attribute fixed of attribute"},
    {"a prohibited attribute", type(R"(<xs:attribute name="a" type="xs:int" use="prohibited"/>)"),
     "small.xsd:3: unknown value 'prohibited' of use"},
    {"a qualified attribute", type(R"(<xs:attribute name="a" type="xs:int" form="qualified"/>)"),
     "small.xsd:3: unknown attribute form of attribute"},
    {"a default of an element", sequence(R"(<xs:element name="E" type="xs:int" default="1"/>)"),
     "small.xsd:3: unknown attribute default of element"},
    {"a blocked element", R"(<xs:element name="E" type="v:T" block="#all"/>)" + type(""),
     "small.xsd:2: unknown attribute block of element"},
    {"a sequence that repeats", type(R"(<xs:sequence maxOccurs="2"/>)"),
     "small.xsd:3: unknown attribute maxOccurs of sequence"},
    {"a choice that may be absent", type(R"(<xs:choice minOccurs="0"/>)"),
     "small.xsd:3: unknown attribute minOccurs of choice"},
    {"an option that may be absent",
     type(R"(<xs:choice><xs:element name="E" type="xs:int" minOccurs="0"/></xs:choice>)"),
     "small.xsd:3: unknown attribute minOccurs of element"},
    {"an option that may be nil",
     type(R"(<xs:choice><xs:element name="E" type="xs:int" nillable="true"/></xs:choice>)"),
     "small.xsd:3: unknown attribute nillable of element"},
    {"two to many", sequence(R"(<xs:element name="E" type="xs:int" minOccurs="2" maxOccurs="unbounded"/>)"),
     "small.xsd:3: unknown value '2' of minOccurs"},
    {"at most three", sequence(R"(<xs:element name="E" type="xs:int" maxOccurs="3"/>)"),
     "small.xsd:3: unknown value '3' of maxOccurs"},
    {"a truth of one", sequence(R"(<xs:element name="E" type="v:T" nillable="1"/>)"),
     "small.xsd:3: unknown value '1' of nillable"},
    {"any element of other namespaces", sequence(R"(<xs:any namespace="##other" processContents="skip"/>)"),
     "small.xsd:3: unknown value '##other' of namespace"},
    {"any element, checked", sequence(R"(<xs:any processContents="strict"/>)"),
     "small.xsd:3: unknown value 'strict' of processContents"},
    {"a bound that can't be restricted",
     R"(<xs:simpleType name="S"><xs:restriction base="xs:int"><xs:maxInclusive value="1" fixed="true"/></xs:restriction></xs:simpleType>)",
     "small.xsd:2: unknown attribute fixed of maxInclusive"},
    {"an attribute of another namespace", R"(<xs:complexType name="T" b:name="x"/>)",
     "small.xsd:2: unknown attribute name of complexType"},
    {"a length beyond all texts",
     R"(<xs:simpleType name="S"><xs:restriction base="xs:string"><xs:maxLength value="10000000000"/></xs:restriction></xs:simpleType>)",
     "small.xsd:2: a length of 10000000000 is beyond all texts"},
};
INSTANTIATE_TEST_SUITE_P(UnknownAttributes, RefusedSchema, testing::ValuesIn(k_unknown_attributes));

std::string note(const std::string& text) {
    return "<xs:annotation><xs:appinfo>" + text + "</xs:appinfo></xs:annotation>";
}

const refused_schema k_unknown_annotations[] = {
    {"an unknown word", type(note("<b:polymorph/>")), "small.xsd:3: unknown annotation polymorph"},
    {"a word of another vocabulary", type(note("<v:polymorphic/>")),
     "small.xsd:3: unknown annotation polymorphic"},
    {"polymorphic on an element",
     R"(<xs:element name="E" type="v:T">)" + note("<b:polymorphic/>") + "</xs:element>" + type(""),
     "small.xsd:2: the annotation polymorphic means nothing on schema/element"},
    {"a class name on a named type", type(note(R"(<b:class name="C"/>)")),
     "small.xsd:3: the annotation class means nothing on schema/complexType"},
    {"an owned attribute",
     type(R"(<xs:attribute name="a" type="xs:int">)" + note("<b:owned/>") + "</xs:attribute>"),
     "small.xsd:3: the annotation owned means nothing on complexType/attribute"},
    {"read-optional on an option",
     type(R"(<xs:choice><xs:element name="E" type="xs:int">)" + note("<b:read-optional/>") +
          "</xs:element></xs:choice>"),
     "small.xsd:3: the annotation read-optional means nothing on choice/element"},
    {"no-presence on a type", type(note("<b:no-presence/>")),
     "small.xsd:3: the annotation no-presence means nothing on schema/complexType"},
    {"always-written on an element",
     sequence(R"(<xs:element name="E" type="xs:int">)" + note("<b:always-written/>") + "</xs:element>"),
     "small.xsd:3: the annotation always-written means nothing on sequence/element"},
    {"an initial value of an attribute",
     type(R"(<xs:attribute name="a" type="xs:int">)" + note(R"(<b:initial value="1"/>)") + "</xs:attribute>"),
     "small.xsd:3: the annotation initial means nothing on complexType/attribute"},
    {"empty-ok on a simple type",
     R"(<xs:simpleType name="S">)" + note("<b:empty-ok/>") +
         R"(<xs:restriction base="xs:int"/></xs:simpleType>)",
     "small.xsd:2: the annotation empty-ok means nothing on schema/simpleType"},
    {"no-standalone on a local element",
     sequence(R"(<xs:element name="E" type="xs:int">)" + note("<b:no-standalone/>") + "</xs:element>"),
     "small.xsd:3: the annotation no-standalone means nothing on sequence/element"},
    {"a document inside",
     sequence(R"(<xs:element name="E" type="xs:int">)" + note("<b:document/>") + "</xs:element>"),
     "small.xsd:3: the annotation document means nothing on sequence/element"},
    {"an annotation of the whole schema", note("<b:document/>"),
     "small.xsd:2: the annotation document means nothing on /schema"},
    {"an initial value that isn't there",
     sequence(R"(<xs:element name="E" type="xs:int">)" + note("<b:initial/>") + "</xs:element>"),
     "small.xsd:3: the annotation initial needs the attribute value"},
    {"an attribute that means nothing", type(note(R"(<b:polymorphic value="1"/>)")),
     "small.xsd:3: unknown attribute value of polymorphic"},
    {"an annotation with content", type(note("<b:polymorphic><b:owned/></b:polymorphic>")),
     "small.xsd:3: the annotation polymorphic holds nothing"},
};
INSTANTIATE_TEST_SUITE_P(UnknownAnnotations, RefusedSchema, testing::ValuesIn(k_unknown_annotations));

// What W3C XML Schema itself refuses is libxml2's to tell: place and subject are enough here.
struct invalid_schema {
    const char* why;
    std::string declarations;
    std::string place;
    std::string subject;
};

void PrintTo(const invalid_schema& c, std::ostream* os) { *os << c.why; }

class InvalidSchema : public testing::TestWithParam<invalid_schema> {};

TEST_P(InvalidSchema, IsToldByPlaceAndReason) {
    const std::string said = refusal(GetParam().declarations);
    EXPECT_EQ(said.substr(0, said.find(' ')), GetParam().place);
    EXPECT_NE(said.find(GetParam().subject), std::string::npos) << said;
    EXPECT_EQ(said.find('\n'), std::string::npos);
}

const invalid_schema k_invalid_schemas[] = {
    {"not well-formed", type("<xs:sequence>"), "small.xsd:4:", "sequence"},
    {"an unknown base", type(R"(<xs:complexContent><xs:extension base="v:A"/></xs:complexContent>)"),
     "small.xsd:2:", "v}A"},
    {"an unknown type of an element", sequence(R"(<xs:element name="E" type="v:A"/>)"),
     "small.xsd:3:", "v}A"},
    {"an unknown element", sequence(R"(<xs:element ref="v:E"/>)"), "small.xsd:3:", "v}E"},
    {"an unknown head", R"(<xs:element name="E" type="v:T" substitutionGroup="v:H"/>)" + type(""),
     "small.xsd:0:", "v}H"},
    {"two types of one name", type("") + "\n" + R"(<xs:complexType name="T"/>)", "small.xsd:5:", "v}T"},
    {"a type that derives from itself",
     type(R"(<xs:complexContent><xs:extension base="v:T"/></xs:complexContent>)"), "small.xsd:2:", "T"},
    {"a bound that is no number",
     "<xs:simpleType name=\"S\"><xs:restriction base=\"xs:int\">\n"
     "<xs:maxInclusive value=\"many\"/></xs:restriction></xs:simpleType>",
     "small.xsd:3:", "many"},
    {"a length that is no number",
     "<xs:simpleType name=\"S\"><xs:restriction base=\"xs:string\">\n"
     "<xs:maxLength value=\"-1\"/></xs:restriction></xs:simpleType>",
     "small.xsd:3:", "-1"},
    {"content that two particles claim",
     sequence(R"(<xs:element name="E" type="xs:int" minOccurs="0"/><xs:element name="E" type="xs:int"/>)"),
     "small.xsd:2:", "not determinist"},
};
INSTANTIATE_TEST_SUITE_P(Schemas, InvalidSchema, testing::ValuesIn(k_invalid_schemas));

TEST(ReadSchema, AMissingFileIsToldByName) {
    try {
        vrl_codegen::read_schema("nowhere/small.xsd");
        FAIL();
    } catch (const vrl_codegen::schema_error& refused) {
        EXPECT_NE(std::string(refused.what()).find("small.xsd"), std::string::npos) << refused.what();
    }
}

TEST(ReadSchema, AMissingModuleIsToldByTheOneThatIncludesIt) {
    EXPECT_NE(refusal(R"(<xs:include schemaLocation="other.xsd"/>)").find("other.xsd"), std::string::npos);
}

// What is read.

const std::string k_type_with_everything = R"(
<xs:simpleType name="Kind"><xs:annotation><xs:documentation>A kind.</xs:documentation></xs:annotation>
  <xs:restriction base="xs:string"><xs:enumeration value="One"/><xs:enumeration value="Two"/></xs:restriction>
</xs:simpleType>
<xs:complexType name="Base" abstract="true">
  <xs:annotation><xs:appinfo><b:polymorphic/></xs:appinfo>
    <xs:documentation>What   all
      have.</xs:documentation><xs:documentation>And more.</xs:documentation></xs:annotation>
  <xs:sequence>
    <xs:element name="Name" type="xs:string" minOccurs="0"/>
    <xs:element name="Size" maxOccurs="unbounded"><xs:simpleType><xs:restriction base="xs:double">
      <xs:minInclusive value="0"/></xs:restriction></xs:simpleType></xs:element>
    <xs:element name="Part" nillable="true"><xs:complexType><xs:choice>
      <xs:element name="A" type="xs:int"/></xs:choice></xs:complexType></xs:element>
    <xs:element ref="v:Thing"/>
  </xs:sequence>
  <xs:attribute name="kind" type="v:Kind" use="required"/>
  <xs:attribute name="level" type="xs:int" default="3">
    <xs:annotation><xs:appinfo><b:always-written/></xs:appinfo></xs:annotation></xs:attribute>
</xs:complexType>
<xs:complexType name="Derived"><xs:complexContent><xs:extension base="v:Base"/></xs:complexContent></xs:complexType>
<xs:element name="Head" type="v:Base" abstract="true"/>
<xs:element name="Thing" type="v:Derived" substitutionGroup="v:Head" nillable="true"/>
<xs:element name="Doc"><xs:annotation><xs:appinfo><b:document/></xs:appinfo></xs:annotation><xs:complexType>
  <xs:simpleContent><xs:extension base="v:Kind"/></xs:simpleContent></xs:complexType></xs:element>
)";

class ReadSchemaOfEverything : public testing::Test {
protected:
    const complex_type& type(const char* key) const { return *m_read.find_type(key); }
    const element_declaration& element(unsigned i) const { return type("Base").elements.at(i); }

    schema m_read = read(k_type_with_everything);
};

TEST_F(ReadSchemaOfEverything, KnowsItsNamespaceAndModules) {
    EXPECT_EQ(m_read.target_namespace, "urn:v");
    ASSERT_EQ(m_read.modules.size(), 1u);
    EXPECT_EQ(m_read.modules.front().name, "small");
}

TEST_F(ReadSchemaOfEverything, AnonymousTypesStandAheadOfTheirOwners) {
    std::vector<std::string> keys;
    for (const complex_type& read : m_read.types) keys.push_back(read.key);
    EXPECT_EQ(keys, (std::vector<std::string>{"Base/Part", "Base", "Derived", "/Doc"}));
    EXPECT_EQ(type("Base/Part").element_name, "Part");
    EXPECT_EQ(type("Base/Part").name, "");
    EXPECT_EQ(type("/Doc").element_name, "Doc");
}

TEST_F(ReadSchemaOfEverything, TypesTellContentAndBase) {
    EXPECT_TRUE(type("Base").is_abstract);
    EXPECT_EQ(type("Base").kind, complex_type::content::sequence);
    EXPECT_EQ(type("Base/Part").kind, complex_type::content::choice);
    EXPECT_EQ(type("Derived").kind, complex_type::content::empty);
    EXPECT_EQ(type("Derived").base, "Base");
    EXPECT_FALSE(type("Derived").is_abstract);
    EXPECT_EQ(type("/Doc").kind, complex_type::content::simple);
    EXPECT_EQ(type("/Doc").text.name, "Kind");
}

TEST_F(ReadSchemaOfEverything, ElementsTellFormAndOccurrence) {
    using form = element_declaration::form;
    EXPECT_EQ(element(0).kind, form::simple);
    EXPECT_EQ(element(0).min_occurs, 0u);
    EXPECT_FALSE(element(0).repeated);
    EXPECT_EQ(element(1).kind, form::simple);
    EXPECT_EQ(element(1).min_occurs, 1u);
    EXPECT_TRUE(element(1).repeated);
    EXPECT_EQ(element(1).simple.limits.min_inclusive, "0");
    EXPECT_EQ(element(2).kind, form::anonymous_type);
    EXPECT_EQ(element(2).type_key, "Base/Part");
    EXPECT_TRUE(element(2).nillable);
    EXPECT_EQ(element(3).kind, form::reference);
    EXPECT_EQ(element(3).name, "Thing");
    EXPECT_EQ(element(3).type_key, "Derived");
}

TEST_F(ReadSchemaOfEverything, AttributesTellUseAndDefault) {
    const std::vector<attribute_declaration>& attributes = type("Base").attributes;
    ASSERT_EQ(attributes.size(), 2u);
    EXPECT_TRUE(attributes[0].required);
    EXPECT_EQ(attributes[0].type.limits.enumeration, (std::vector<std::string>{"One", "Two"}));
    EXPECT_FALSE(attributes[0].default_value.has_value());
    EXPECT_FALSE(attributes[1].required);
    EXPECT_EQ(attributes[1].default_value, "3");
    EXPECT_TRUE(has_note(attributes[1].notes, "always-written"));
}

TEST_F(ReadSchemaOfEverything, GlobalElementsTellTypeAndGroup) {
    const global_element& thing = *m_read.find_element("Thing");
    EXPECT_EQ(thing.type_key, "Derived");
    EXPECT_EQ(thing.substitution_group, "Head");
    EXPECT_TRUE(thing.nillable);
    EXPECT_FALSE(thing.anonymous);
    EXPECT_TRUE(m_read.find_element("Head")->is_abstract);
    EXPECT_TRUE(m_read.is_head("Head"));
    EXPECT_FALSE(m_read.is_head("Thing"));
    EXPECT_TRUE(m_read.find_element("Doc")->anonymous);
    EXPECT_TRUE(has_note(m_read.find_element("Doc")->notes, "document"));
    EXPECT_EQ(m_read.find_element("Nothing"), nullptr);
}

TEST_F(ReadSchemaOfEverything, DocumentationIsFoldedAndJoined) {
    EXPECT_EQ(type("Base").documentation, "What all have. And more.");
}

TEST_F(ReadSchemaOfEverything, DeclarationsKnowTheirPlaces) {
    EXPECT_EQ(type("Base").place, "small.xsd:6");
    EXPECT_EQ(element(0).place, "small.xsd:11");
    EXPECT_EQ(type("Base").attributes[0].place, "small.xsd:18");
    EXPECT_EQ(m_read.find_element("Head")->place, "small.xsd:23");
}

TEST_F(ReadSchemaOfEverything, NamedSimpleTypesAreKept) {
    ASSERT_EQ(m_read.simple_types.size(), 1u);
    EXPECT_EQ(m_read.simple_types[0].name, "Kind");
    EXPECT_EQ(m_read.simple_types[0].module, "small");
    EXPECT_EQ(m_read.simple_types[0].documentation, "A kind.");
    EXPECT_EQ(m_read.simple_types[0].built_in, "string");
}

// Facets along a chain of restrictions.

struct facet_case {
    const char* why;
    const char* base;
    const char* own;
    facets expected;
};

void PrintTo(const facet_case& c, std::ostream* os) { *os << c.why; }

class Facets : public testing::TestWithParam<facet_case> {};

TEST_P(Facets, OfARestrictionStandForThoseOfItsBase) {
    const bool text = std::string(GetParam().base).find("ength") != std::string::npos ||
                      std::string(GetParam().base).find("enum") != std::string::npos;
    const schema source =
        read(std::string("<xs:simpleType name=\"A\"><xs:restriction base=\"") +
             (text ? "xs:string" : "xs:double") + "\">" + GetParam().base +
             "</xs:restriction></xs:simpleType><xs:simpleType name=\"B\">" + "<xs:restriction base=\"v:A\">" +
             GetParam().own + "</xs:restriction></xs:simpleType>");
    EXPECT_EQ(source.simple_types.at(1).limits, GetParam().expected);
}

facets bounds(const char* low, const char* above, const char* high, const char* below) {
    facets made;
    if (low != nullptr) made.min_inclusive = low;
    if (above != nullptr) made.min_exclusive = above;
    if (high != nullptr) made.max_inclusive = high;
    if (below != nullptr) made.max_exclusive = below;
    return made;
}

facets lengths(unsigned low, unsigned high) {
    facets made;
    made.min_length = low;
    made.max_length = high;
    return made;
}

facets literals(const std::vector<std::string>& texts) {
    facets made;
    made.enumeration = texts;
    return made;
}

const facet_case k_chains[] = {
    {"inherited", R"(<xs:minInclusive value="1"/>)", "", bounds("1", nullptr, nullptr, nullptr)},
    {"narrowed", R"(<xs:minInclusive value="1"/><xs:maxInclusive value="9"/>)",
     R"(<xs:maxInclusive value="5"/>)", bounds("1", nullptr, "5", nullptr)},
    {"a lower bound that opens", R"(<xs:minInclusive value="1"/>)", R"(<xs:minExclusive value="1"/>)",
     bounds(nullptr, "1", nullptr, nullptr)},
    {"a lower bound that closes", R"(<xs:minExclusive value="1"/>)", R"(<xs:minInclusive value="2"/>)",
     bounds("2", nullptr, nullptr, nullptr)},
    {"an upper bound that opens", R"(<xs:maxInclusive value="9"/>)", R"(<xs:maxExclusive value="9"/>)",
     bounds(nullptr, nullptr, nullptr, "9")},
    {"an upper bound that closes", R"(<xs:maxExclusive value="9"/>)", R"(<xs:maxInclusive value="8"/>)",
     bounds(nullptr, nullptr, "8", nullptr)},
    {"a length is both bounds", R"(<xs:length value="4"/>)", "", lengths(4, 4)},
    {"lengths narrowed", R"(<xs:minLength value="1"/><xs:maxLength value="9"/>)",
     R"(<xs:maxLength value="5"/>)", lengths(1, 5)},
    {"literals inherited", R"(<xs:enumeration value="a"/><xs:enumeration value="b"/>)", "",
     literals({"a", "b"})},
    {"literals left over", R"(<xs:enumeration value="a"/><xs:enumeration value="b"/>)",
     R"(<xs:enumeration value="b"/>)", literals({"b"})},
};
INSTANTIATE_TEST_SUITE_P(Chains, Facets, testing::ValuesIn(k_chains));

TEST(ReadSchema, APatternIsNoted) {
    const schema source = read(
        R"(<xs:simpleType name="A"><xs:restriction base="xs:dateTime"><xs:pattern value=".+Z"/></xs:restriction></xs:simpleType>)");
    EXPECT_TRUE(source.simple_types.at(0).limits.has_pattern);
}

// Modules.

TEST(ReadSchema, ModulesStandBehindThoseThatTheyInclude) {
    const temporary_folder folder;
    folder.write("shared.xsd", around(R"(<xs:annotation><xs:documentation>Shared things.</xs:documentation>
</xs:annotation><xs:complexType name="S"/>)"));
    folder.write("middle.xsd",
                 around(R"(<xs:include schemaLocation="shared.xsd"/><xs:complexType name="M"><xs:sequence>
<xs:element name="E" type="v:S"/></xs:sequence></xs:complexType>)"));
    const schema source = vrl_codegen::read_schema(folder.write(
        "top.xsd",
        around(R"(<xs:include schemaLocation="shared.xsd"/><xs:include schemaLocation="middle.xsd"/>)")));
    ASSERT_EQ(source.modules.size(), 3u);
    EXPECT_EQ(source.modules[0].name, "shared");
    EXPECT_EQ(source.modules[0].documentation, "Shared things.");
    EXPECT_EQ(source.modules[1].name, "middle");
    EXPECT_EQ(source.modules[2].name, "top");
    EXPECT_EQ(source.find_type("S")->module, "shared");
    EXPECT_EQ(source.find_type("M")->module, "middle");
    EXPECT_EQ(source.find_type("M")->place, "middle.xsd:2");
}

}  // namespace
