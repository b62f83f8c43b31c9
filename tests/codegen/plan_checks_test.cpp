#include <gtest/gtest.h>

#include <ostream>
#include <string>

#include "codegen/plan_names.h"
#include "tests/codegen/small_schema.h"

namespace {

using codegen_tests::refusal;
using vrl_codegen::enumerator;
using vrl_codegen::identifier;
using vrl_codegen::is_identifier;

struct refused_schema {
    const char* why;
    std::string declarations;
    std::string said;
};

void PrintTo(const refused_schema& c, std::ostream* os) { *os << c.why; }

class RefusedPlan : public testing::TestWithParam<refused_schema> {};

TEST_P(RefusedPlan, IsToldByPlaceAndReason) { EXPECT_EQ(refusal(GetParam().declarations), GetParam().said); }

std::string note(const std::string& text) {
    return "<xs:annotation><xs:appinfo>" + text + "</xs:appinfo></xs:annotation>";
}

std::string sequence(const std::string& particles) {
    return "<xs:complexType name=\"T\"><xs:sequence>\n" + particles + "\n</xs:sequence></xs:complexType>\n";
}

const std::string k_no_type = "<xs:complexType/>";

const refused_schema k_class_names[] = {
    {"two elements of anonymous types",
     sequence("<xs:element name=\"E\">" + k_no_type +
              "</xs:element>\n<xs:element name=\"F\"><xs:complexType><xs:sequence>\n"
              "<xs:element name=\"E\">" +
              k_no_type + "</xs:element></xs:sequence></xs:complexType></xs:element>"),
     "small.xsd:5: the class E is there already, from small.xsd:3: "
     "give the type a name of its own with the annotation 'class'"},
    {"an element with the name of a type",
     "<xs:complexType name=\"T\"/>\n<xs:element name=\"T\" type=\"v:T\"/>",
     "small.xsd:3: the class T is there already, from small.xsd:2: a global element is a class"},
    {"a name that was given",
     "<xs:complexType name=\"T\"/>\n<xs:element name=\"E\"><xs:complexType>" + note("<b:class name=\"T\"/>") +
         "</xs:complexType></xs:element>",
     "small.xsd:3: the class T is there already, from small.xsd:2: "
     "give the type a name of its own with the annotation 'class'"},
    {"a type with the name of a group",
     "<xs:complexType name=\"sg_H\">" + note("<b:polymorphic/>") +
         "</xs:complexType>\n<xs:element name=\"H\" type=\"v:sg_H\"/>"
         "<xs:element name=\"M\" type=\"v:sg_H\" substitutionGroup=\"v:H\"/>",
     "small.xsd:3: the class sg_H is there already, from small.xsd:2: a substitution group is a class"},
    {"a nillable element with the name of a type",
     sequence("<xs:element name=\"T\" type=\"v:T\" nillable=\"true\" minOccurs=\"0\"/>"),
     "small.xsd:3: the class T is there already, from small.xsd:2: a nillable element of a named type is a "
     "class"},
    {"nillable elements of two types",
     "<xs:complexType name=\"A\"/><xs:complexType name=\"B\"/>" +
         sequence("<xs:element name=\"E\" type=\"v:A\" nillable=\"true\"/>") +
         "<xs:complexType name=\"U\"><xs:sequence><xs:element name=\"E\" type=\"v:B\" "
         "nillable=\"true\"/></xs:sequence></xs:complexType>",
     "small.xsd:5: the class E is there already, from small.xsd:3: a nillable element of a named type is a "
     "class"},
    {"a name that C++ can't take", "<xs:complexType name=\"Co-lor\"/>",
     "small.xsd:2: no class can be called Co-lor"},
    {"a given name that C++ can't take",
     "<xs:element name=\"E\"><xs:complexType>" + note("<b:class name=\"1st\"/>") +
         "</xs:complexType></xs:element>",
     "small.xsd:2: no class can be called 1st"},
};
INSTANTIATE_TEST_SUITE_P(ClassNames, RefusedPlan, testing::ValuesIn(k_class_names));

std::string enumerated(const std::string& one, const std::string& two) {
    return sequence(
        "<xs:element name=\"E\"><xs:simpleType><xs:restriction base=\"xs:string\"><xs:enumeration value=\"" +
        one + "\"/><xs:enumeration value=\"" + two + "\"/></xs:restriction></xs:simpleType></xs:element>");
}

const refused_schema k_member_names[] = {
    {"an attribute with the name of a child",
     "<xs:complexType name=\"T\"><xs:sequence><xs:element name=\"a\" type=\"xs:int\"/></xs:sequence>"
     "<xs:attribute name=\"a\" type=\"xs:int\"/></xs:complexType>",
     "small.xsd:2: T has two members called a"},
    {"a child twice",
     sequence("<xs:element name=\"a\" type=\"xs:int\"/><xs:element name=\"b\" type=\"xs:int\"/><xs:element "
              "name=\"a\" type=\"xs:int\"/>"),
     "small.xsd:2: T has two members called a"},
    {"a child with the name of a base's",
     sequence("<xs:element name=\"a\" type=\"xs:int\"/>") +
         "<xs:complexType name=\"D\"><xs:complexContent><xs:extension base=\"v:T\"><xs:attribute name=\"a\" "
         "type=\"xs:int\"/>"
         "</xs:extension></xs:complexContent></xs:complexType>",
     "small.xsd:5: D has two members called a"},
    {"a name that C++ can't take", sequence("<xs:element name=\"a.b\" type=\"xs:int\"/>"),
     "small.xsd:2: no accessor can be called after a.b"},
    {"an option called none",
     "<xs:complexType name=\"T\"><xs:choice><xs:element name=\"none\" "
     "type=\"xs:int\"/></xs:choice></xs:complexType>",
     "small.xsd:2: no option of a choice can be called none"},
    {"literals that differ in what C++ can't take", enumerated("a-b", "a.b"),
     "small.xsd:2: T.E: the literal a.b would share an enumerator with a-b"},
    {"a literal with the name of no match", enumerated("a", "no match"),
     "small.xsd:2: T.E: the literal no match would share an enumerator with the state of no match"},
};
INSTANTIATE_TEST_SUITE_P(MemberNames, RefusedPlan, testing::ValuesIn(k_member_names));

const std::string k_choice =
    "<xs:complexType name=\"C\"><xs:choice><xs:element name=\"a\" "
    "type=\"xs:int\"/></xs:choice></xs:complexType>";
const std::string k_any = "<xs:any processContents=\"skip\" maxOccurs=\"unbounded\"/>";

std::string derived(const std::string& base, const std::string& content = {}) {
    return "\n<xs:complexType name=\"D\"><xs:complexContent><xs:extension base=\"v:" + base + "\">" +
           content + "</xs:extension></xs:complexContent></xs:complexType>";
}

const refused_schema k_structures[] = {
    {"a nillable value", sequence("<xs:element name=\"a\" type=\"xs:int\" nillable=\"true\"/>"),
     "small.xsd:3: an element of a simple type can't be nillable"},
    {"xs:any beside others",
     sequence("<xs:element name=\"a\" type=\"xs:int\"/><xs:any processContents=\"skip\" minOccurs=\"0\" "
              "namespace=\"##any\"/>"),
     "small.xsd:3: xs:any stands alone in its type, and is repeated"},
    {"xs:any only once", sequence("<xs:any processContents=\"skip\"/>"),
     "small.xsd:3: xs:any stands alone in its type, and is repeated"},
    {"a type derived from a choice", k_choice + derived("C"), "small.xsd:3: nothing derives from a choice"},
    {"a type derived from xs:any",
     "<xs:complexType name=\"A\"><xs:sequence>" + k_any + "</xs:sequence></xs:complexType>" + derived("A"),
     "small.xsd:3: nothing derives from a type that holds xs:any"},
    {"a derived type with xs:any",
     "<xs:complexType name=\"A\"/>" + derived("A", "<xs:sequence>" + k_any + "</xs:sequence>"),
     "small.xsd:3: a type that holds xs:any derives from none"},
    {"a base that is no type of the schema",
     "<xs:complexType name=\"D\"><xs:complexContent><xs:extension "
     "base=\"xs:anyType\"/></xs:complexContent></xs:complexType>",
     "small.xsd:2: the base has to be a complex type of the schema"},
    {"a group whose members nothing holds together",
     "<xs:complexType name=\"T\"/>\n<xs:element name=\"H\" type=\"v:T\"/><xs:element name=\"M\" type=\"v:T\" "
     "substitutionGroup=\"v:H\"/>",
     "small.xsd:3: the type of the head of a substitution group has to be polymorphic"},
    {"a group in a group",
     "<xs:complexType name=\"T\">" + note("<b:polymorphic/>") +
         "</xs:complexType><xs:element name=\"H\" type=\"v:T\"/>\n"
         "<xs:element name=\"M\" type=\"v:T\" substitutionGroup=\"v:H\"/><xs:element name=\"N\" type=\"v:T\" "
         "substitutionGroup=\"v:M\"/>",
     "small.xsd:3: a member of a substitution group can't be the head of another"},
    {"a pattern that nothing checks",
     sequence("<xs:element name=\"a\"><xs:simpleType><xs:restriction base=\"xs:string\"><xs:pattern "
              "value=\"x\"/></xs:restriction></xs:simpleType></xs:element>"),
     "small.xsd:3: nothing checks these facets of xs:string"},
};
INSTANTIATE_TEST_SUITE_P(Structures, RefusedPlan, testing::ValuesIn(k_structures));

const refused_schema k_annotations[] = {
    {"read-optional on an optional element",
     sequence("<xs:element name=\"a\" type=\"xs:int\" minOccurs=\"0\">" + note("<b:read-optional/>") +
              "</xs:element>"),
     "small.xsd:3: read-optional means nothing on an element that isn't required"},
    {"no-presence on an optional element",
     sequence("<xs:element name=\"a\" type=\"xs:int\" minOccurs=\"0\">" + note("<b:no-presence/>") +
              "</xs:element>"),
     "small.xsd:3: no-presence means nothing on an element that isn't required once"},
    {"no-presence on a list",
     sequence("<xs:element name=\"a\" type=\"xs:int\" maxOccurs=\"unbounded\">" + note("<b:no-presence/>") +
              "</xs:element>"),
     "small.xsd:3: no-presence means nothing on an element that isn't required once"},
    {"owned on a value",
     sequence("<xs:element name=\"a\" type=\"xs:int\">" + note("<b:owned/>") + "</xs:element>"),
     "small.xsd:3: owned means nothing on an element of a simple type"},
    {"initial on a list",
     sequence("<xs:element name=\"a\" type=\"xs:int\" maxOccurs=\"unbounded\">" +
              note("<b:initial value=\"1\"/>") + "</xs:element>"),
     "small.xsd:3: initial means nothing but on a single element of a simple type"},
    {"initial on an object",
     "<xs:complexType name=\"A\"/>" + sequence("<xs:element name=\"a\" type=\"v:A\">" +
                                               note("<b:initial value=\"1\"/>") + "</xs:element>"),
     "small.xsd:3: initial means nothing but on a single element of a simple type"},
    {"initial with a value that doesn't fit",
     sequence("<xs:element name=\"a\" type=\"xs:int\">" + note("<b:initial value=\"1.5\"/>") +
              "</xs:element>"),
     "small.xsd:3: no value of int starts as '1.5'"},
    {"always-written without a default",
     "<xs:complexType name=\"T\"><xs:attribute name=\"a\" type=\"xs:int\">" + note("<b:always-written/>") +
         "</xs:attribute></xs:complexType>",
     "small.xsd:2: an attribute that is always written needs a default"},
    {"optional-text without text",
     "<xs:complexType name=\"T\">" + note("<b:optional-text/>") + "</xs:complexType>",
     "small.xsd:2: optional-text means nothing on a type without text"},
    {"polymorphic on a derived type",
     "<xs:complexType name=\"T\"/>\n<xs:complexType name=\"D\">" + note("<b:polymorphic/>") +
         "<xs:complexContent><xs:extension base=\"v:T\"/></xs:complexContent></xs:complexType>",
     "small.xsd:3: polymorphic stands on the root of a derivation tree"},
    {"a document of a named type",
     "<xs:complexType name=\"T\"/>\n<xs:element name=\"E\" type=\"v:T\">" + note("<b:document/>") +
         "</xs:element>",
     "small.xsd:3: the document element has a type of its own, without a name"},
    {"a document with initial values",
     "<xs:element name=\"E\">" + note("<b:document/>") +
         "\n<xs:complexType><xs:attribute name=\"a\" type=\"xs:int\" "
         "default=\"1\"/></xs:complexType></xs:element>",
     "small.xsd:3: what the document starts with is written by hand"},
};
INSTANTIATE_TEST_SUITE_P(Annotations, RefusedPlan, testing::ValuesIn(k_annotations));

TEST(Names, WhatCppCantTakeBecomesAnUnderscore) {
    EXPECT_EQ(identifier("Target_IT8.7/1"), "Target_IT8_7_1");
    EXPECT_EQ(enumerator("Status", "Status_DIN-NB"), "Status_Status_DIN_NB");
}

TEST(Names, AnIdentifierStartsWithALetterAndHoldsNothingElse) {
    EXPECT_TRUE(is_identifier("Color_9"));
    EXPECT_TRUE(is_identifier("_a"));
    EXPECT_FALSE(is_identifier("9_Color"));
    EXPECT_FALSE(is_identifier("Co-lor"));
    EXPECT_FALSE(is_identifier("Co.lor"));
    EXPECT_FALSE(is_identifier("Col\xc3\xb6r"));
    EXPECT_FALSE(is_identifier(""));
}

}  // namespace
