#include "codegen/class_plan.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <ostream>
#include <string>
#include <vector>

#include "tests/codegen/small_schema.h"

namespace {

using codegen_tests::plan_of;
using vrl_codegen::class_kind;
using vrl_codegen::class_plan;
using vrl_codegen::content_kind;
using vrl_codegen::group_member_plan;
using vrl_codegen::member_kind;
using vrl_codegen::member_plan;
using vrl_codegen::module_plan;
using vrl_codegen::plan;
using vrl_codegen::token_plan;

std::vector<std::string> names_of_classes(const plan& model) {
    std::vector<std::string> names;
    for (const class_plan& made : model.classes) names.push_back(made.name);
    return names;
}

std::string note(const std::string& text) {
    return "<xs:annotation><xs:appinfo>" + text + "</xs:appinfo></xs:annotation>";
}

std::string element(const std::string& attributes, const std::string& content = {}) {
    return "<xs:element " + attributes + ">" + content + "</xs:element>";
}

std::string type(const std::string& name, const std::string& content) {
    return "<xs:complexType name=\"" + name + "\">" + content + "</xs:complexType>";
}

std::string sequence(const std::string& name, const std::string& particles) {
    return type(name, "<xs:sequence>" + particles + "</xs:sequence>");
}

std::string derived(const std::string& name, const std::string& base, const std::string& content = {}) {
    return type(name, "<xs:complexContent><xs:extension base=\"v:" + base + "\">" + content +
                          "</xs:extension></xs:complexContent>");
}

// Classes and their names.

TEST(PlanClasses, ATypeIsAClassUnderItsName) {
    const plan model = plan_of(sequence("T", element("name=\"E\" type=\"xs:int\"")));
    ASSERT_EQ(names_of_classes(model), std::vector<std::string>{"T"});
    const class_plan& made = model.classes.front();
    EXPECT_EQ(made.kind, class_kind::type);
    EXPECT_EQ(made.content, content_kind::children);
    EXPECT_EQ(made.xml_name, "T");
    EXPECT_EQ(made.module, "small");
    EXPECT_TRUE(made.declares_namespaces);
    EXPECT_TRUE(made.declares_members);
    EXPECT_FALSE(made.standalone);
    EXPECT_FALSE(made.polymorphic);
}

TEST(PlanClasses, AnAnonymousTypeIsAClassUnderItsElementsName) {
    const plan model = plan_of(sequence("T", element("name=\"E\"", "<xs:complexType/>")));
    EXPECT_EQ(names_of_classes(model), (std::vector<std::string>{"E", "T"}));
    EXPECT_FALSE(model.find("E")->declares_namespaces);
    EXPECT_EQ(model.find("T")->members.at(0).class_name, "E");
}

TEST(PlanClasses, AnAnonymousTypeTakesTheNameThatItIsGiven) {
    const plan model =
        plan_of(sequence("T", element("name=\"E\"", "<xs:complexType>" + note("<b:class name=\"T_E\"/>") +
                                                        "</xs:complexType>")));
    EXPECT_EQ(names_of_classes(model), (std::vector<std::string>{"T_E", "T"}));
    EXPECT_EQ(model.find("T")->members.at(0).class_name, "T_E");
    EXPECT_EQ(model.find("T_E")->xml_name, "E");
}

TEST(PlanClasses, AGlobalElementOfANamedTypeIsAThinClass) {
    const plan model = plan_of(element("name=\"E\" type=\"v:T\"") + type("T", ""));
    const class_plan& made = *model.find("E");
    EXPECT_EQ(made.kind, class_kind::element);
    EXPECT_EQ(made.base, "T");
    EXPECT_FALSE(made.declares_members);
    EXPECT_TRUE(made.standalone);
    EXPECT_TRUE(made.members.empty());
}

TEST(PlanClasses, AGlobalElementOfItsOwnTypeIsTheClassOfThatType) {
    const plan model = plan_of(element("name=\"E\"", "<xs:complexType/>"));
    ASSERT_EQ(names_of_classes(model), std::vector<std::string>{"E"});
    EXPECT_EQ(model.classes.front().kind, class_kind::type);
    EXPECT_TRUE(model.classes.front().standalone);
    EXPECT_TRUE(model.classes.front().declares_namespaces);
}

TEST(PlanClasses, TheDocumentIsTheRoot) {
    const plan model = plan_of(element("name=\"Doc\"", note("<b:document/>") + "<xs:complexType/>"));
    EXPECT_TRUE(model.find("Doc")->is_document());
    EXPECT_TRUE(model.find("Doc")->has_init());
    EXPECT_EQ(model.document_namespace, "urn:v");
}

TEST(PlanClasses, AnElementIsntStandaloneIfItIsAnnotatedSo) {
    const plan model =
        plan_of(element("name=\"E\" type=\"v:T\"", note("<b:no-standalone/>")) + type("T", ""));
    EXPECT_FALSE(model.find("E")->standalone);
}

TEST(PlanClasses, ANillableElementOfANamedTypeIsAClassOfItsOwn) {
    const plan model =
        plan_of(sequence("T", element("name=\"E\" type=\"v:N\" nillable=\"true\"")) +
                sequence("U", element("name=\"E\" type=\"v:N\" nillable=\"true\"")) + type("N", ""));
    EXPECT_EQ(names_of_classes(model), (std::vector<std::string>{"T", "U", "N", "E"}));
    const class_plan& made = *model.find("E");
    EXPECT_EQ(made.base, "N");
    EXPECT_TRUE(made.nillable);
    EXPECT_TRUE(made.declares_members);
    EXPECT_FALSE(made.declares_namespaces);
    EXPECT_FALSE(model.find("N")->nillable);
    EXPECT_EQ(model.find("U")->members.at(0).class_name, "E");
}

TEST(PlanClasses, ANillableElementOfItsOwnTypeCarriesTheFlagItself) {
    const plan model = plan_of(sequence("T", element("name=\"E\" nillable=\"true\"", "<xs:complexType/>")));
    EXPECT_EQ(names_of_classes(model), (std::vector<std::string>{"E", "T"}));
    EXPECT_TRUE(model.find("E")->nillable);
}

const std::string k_text = "<xs:simpleContent><xs:extension base=\"xs:string\"/></xs:simpleContent>";

TEST(PlanClasses, SettingTheTextOfANillableClassEndsNil) {
    const plan model = plan_of(sequence("T", element("name=\"E\" nillable=\"true\"",
                                                     "<xs:complexType>" + k_text + "</xs:complexType>") +
                                                 element("name=\"F\" type=\"v:N\" nillable=\"true\"")) +
                               type("N", k_text));
    EXPECT_TRUE(model.find("E")->text()->ends_nil);
    EXPECT_EQ(model.find("E")->renamed_text, "");
    EXPECT_FALSE(model.find("N")->text()->ends_nil);
    EXPECT_EQ(model.find("F")->renamed_text, "std::wstring const&");
    EXPECT_TRUE(model.find("F")->text_only);
}

TEST(PlanClasses, BasesStandAheadOfWhatDerivesFromThem) {
    const plan model =
        plan_of(element("name=\"E\" type=\"v:C\"") + derived("C", "B") + derived("B", "A") + type("A", ""));
    EXPECT_EQ(names_of_classes(model), (std::vector<std::string>{"A", "B", "C", "E"}));
}

TEST(PlanClasses, AnElementIsEmptyOkIfItsTypeIs) {
    const plan model =
        plan_of(element("name=\"E\" type=\"v:T\"") + type("T", note("<b:empty-ok/>")) + derived("D", "T"));
    EXPECT_TRUE(model.find("T")->accepts_empty);
    EXPECT_TRUE(model.find("E")->accepts_empty);
    EXPECT_FALSE(model.find("D")->accepts_empty);
}

TEST(PlanClasses, OnlyAnAncestorsRequiredAttributesAreAsked) {
    const std::string attribute = "<xs:attribute name=\"a\" type=\"xs:int\" use=\"required\"/>";
    const plan model = plan_of(type("A", attribute) + derived("B", "A") + derived("C", "B") + type("D", "") +
                               derived("E", "D"));
    EXPECT_FALSE(model.find("A")->base_requires_attributes);
    EXPECT_TRUE(model.find("B")->base_requires_attributes);
    EXPECT_TRUE(model.find("C")->base_requires_attributes);
    EXPECT_FALSE(model.find("E")->base_requires_attributes);
}

// Which steps a class has of its own.

struct steps_case {
    const char* why;
    std::string declarations;
    bool attribute_reading;
    bool attributes;
    bool content;
};

void PrintTo(const steps_case& c, std::ostream* os) { *os << c.why; }

class PlanSteps : public testing::TestWithParam<steps_case> {};

TEST_P(PlanSteps, AreOwnWhereTheClassAddsSomething) {
    const plan model = plan_of(GetParam().declarations);
    const class_plan& made = *model.find("C");
    EXPECT_EQ(made.has_own_attribute_reading(), GetParam().attribute_reading);
    EXPECT_EQ(made.has_own_attributes(), GetParam().attributes);
    EXPECT_EQ(made.has_own_content(), GetParam().content);
}

const std::string k_attribute = "<xs:attribute name=\"a\" type=\"xs:int\"/>";
const std::string k_children = "<xs:sequence><xs:element name=\"E\" type=\"xs:int\"/></xs:sequence>";

const steps_case k_steps[] = {
    {"without a base, all", type("C", ""), true, true, true},
    {"with a base, none by itself", type("B", k_children) + derived("C", "B"), false, false, false},
    {"with attributes", type("B", k_children) + derived("C", "B", k_attribute), true, true, false},
    {"with children", type("B", k_attribute) + derived("C", "B", k_children), false, false, true},
    {"with the nil flag", type("B", "") + sequence("U", element("name=\"C\" type=\"v:B\" nillable=\"true\"")),
     true, false, false},
};
INSTANTIATE_TEST_SUITE_P(Classes, PlanSteps, testing::ValuesIn(k_steps));

// Members.

struct member_case {
    const char* why;
    std::string type_content;  ///< of the type T; its first member counts
    member_kind kind;
    bool required;
    bool presence_accessors;
};

void PrintTo(const member_case& c, std::ostream* os) { *os << c.why; }

class PlanMember : public testing::TestWithParam<member_case> {};

const std::string k_family = type("Root", note("<b:polymorphic/>")) + derived("Sub", "Root") +
                             element("name=\"Head\" type=\"v:Root\" abstract=\"true\"") +
                             element("name=\"Sub1\" type=\"v:Sub\" substitutionGroup=\"v:Head\"");

TEST_P(PlanMember, FollowsFromItsDeclaration) {
    const plan model = plan_of(k_family + type("T", GetParam().type_content));
    const member_plan& member = model.find("T")->members.at(0);
    EXPECT_EQ(member.kind, GetParam().kind);
    EXPECT_EQ(member.required, GetParam().required);
    EXPECT_EQ(member.has_presence_accessors(), GetParam().presence_accessors);
}

std::string in_sequence(const std::string& particle) { return "<xs:sequence>" + particle + "</xs:sequence>"; }
std::string in_choice(const std::string& particle) { return "<xs:choice>" + particle + "</xs:choice>"; }

const member_case k_members[] = {
    {"an attribute", "<xs:attribute name=\"a\" type=\"xs:int\"/>", member_kind::attribute, false, true},
    {"a required attribute", "<xs:attribute name=\"a\" type=\"xs:int\" use=\"required\"/>",
     member_kind::attribute, true, false},
    {"text", k_text, member_kind::text, true, false},
    {"optional text", note("<b:optional-text/>") + k_text, member_kind::text, false, true},
    {"a value", in_sequence(element("name=\"E\" type=\"xs:int\"")), member_kind::value, true, false},
    {"an optional value", in_sequence(element("name=\"E\" type=\"xs:int\" minOccurs=\"0\"")),
     member_kind::value, false, true},
    {"values", in_sequence(element("name=\"E\" type=\"xs:int\" minOccurs=\"0\" maxOccurs=\"unbounded\"")),
     member_kind::value_list, false, false},
    {"one or more values", in_sequence(element("name=\"E\" type=\"xs:int\" maxOccurs=\"unbounded\"")),
     member_kind::value_list, true, false},
    {"an object", in_sequence(element("name=\"E\" type=\"v:Root\"")), member_kind::object, true, false},
    {"an optional object", in_sequence(element("name=\"E\" type=\"v:Root\" minOccurs=\"0\"")),
     member_kind::object, false, true},
    {"an object that is always written",
     in_sequence(element("name=\"E\" type=\"v:Root\"", note("<b:no-presence/>"))), member_kind::object, true,
     false},
    {"objects", in_sequence(element("name=\"E\" type=\"v:Root\" minOccurs=\"0\" maxOccurs=\"unbounded\"")),
     member_kind::object_list, false, false},
    {"an object of a global element", in_sequence(element("ref=\"v:Sub1\" minOccurs=\"0\"")),
     member_kind::object, false, true},
    {"a group", in_sequence(element("ref=\"v:Head\"")), member_kind::group, true, false},
    {"an optional group", in_sequence(element("ref=\"v:Head\" minOccurs=\"0\"")), member_kind::group, false,
     true},
    {"groups", in_sequence(element("ref=\"v:Head\" maxOccurs=\"unbounded\"")), member_kind::group_list, true,
     false},
    {"elements of any name", in_sequence("<xs:any processContents=\"skip\" maxOccurs=\"unbounded\"/>"),
     member_kind::any_list, true, false},
    {"a value as an option", in_choice(element("name=\"E\" type=\"xs:int\"")), member_kind::value_option,
     true, false},
    {"an object as an option", in_choice(element("name=\"E\" type=\"v:Root\"")), member_kind::object_option,
     true, false},
};
INSTANTIATE_TEST_SUITE_P(Kinds, PlanMember, testing::ValuesIn(k_members));

TEST(PlanMembers, ClassesOfObjects) {
    const plan model =
        plan_of(k_family +
                sequence("T", element("ref=\"v:Head\"") + element("ref=\"v:Sub1\"") +
                                  element("name=\"R\" type=\"v:Root\"") +
                                  element("name=\"C\"", "<xs:complexType>" +
                                                            in_choice(element("name=\"E\" type=\"xs:int\"")) +
                                                            "</xs:complexType>")));
    const std::vector<member_plan>& members = model.find("T")->members;
    EXPECT_EQ(members.at(0).class_name, "sg_Head");
    EXPECT_EQ(members.at(1).class_name, "Sub1");
    EXPECT_EQ(members.at(2).class_name, "Root");
    EXPECT_FALSE(members.at(2).holds_choice);
    EXPECT_EQ(members.at(3).class_name, "C");
    EXPECT_TRUE(members.at(3).holds_choice);
}

TEST(PlanMembers, WhatIsDemandedOnReadingAndOnWriting) {
    const plan model = plan_of(sequence(
        "T", element("name=\"A\" type=\"xs:int\"") + element("name=\"B\" type=\"xs:int\" minOccurs=\"0\"") +
                 element("name=\"C\" type=\"xs:int\"", note("<b:read-optional/>")) +
                 element("name=\"D\" type=\"xs:int\"", note("<b:no-presence/>"))));
    const std::vector<member_plan>& members = model.find("T")->members;
    std::string reading;
    std::string writing;
    for (const member_plan& member : members) {
        if (member.demanded_on_reading()) reading += member.name;
        if (member.demanded_on_writing()) writing += member.name;
    }
    EXPECT_EQ(reading, "AD");
    EXPECT_EQ(writing, "AC");
}

TEST(PlanMembers, DocumentationIsTheMembersOwnOrThatOfItsType) {
    const plan model = plan_of(
        "<xs:simpleType name=\"S\"><xs:annotation><xs:documentation>Of the "
        "type.</xs:documentation></xs:annotation>"
        "<xs:restriction base=\"xs:int\"/></xs:simpleType>" +
        sequence(
            "T",
            element("name=\"A\" type=\"v:S\"") +
                element("name=\"B\" type=\"v:S\"",
                        "<xs:annotation><xs:documentation>Its own.</xs:documentation></xs:annotation>")));
    EXPECT_EQ(model.find("T")->members.at(0).documentation, "Of the type.");
    EXPECT_EQ(model.find("T")->members.at(1).documentation, "Its own.");
}

TEST(PlanMembers, InitialValuesComeFromDefaultsAndAnnotations) {
    const plan model = plan_of(
        type("T", in_sequence(element("name=\"E\" type=\"xs:double\"", note("<b:initial value=\"2.5\"/>")) +
                              element("name=\"F\" type=\"xs:double\"")) +
                      "<xs:attribute name=\"a\" type=\"xs:string\" default=\"usual\"/>") +
        sequence("U", element("name=\"E\" type=\"xs:int\"")));
    const class_plan& made = *model.find("T");
    EXPECT_EQ(made.members.at(0).initial, "usual");
    EXPECT_EQ(made.members.at(1).initial, "2.5");
    EXPECT_EQ(made.members.at(2).initial, "");
    EXPECT_TRUE(made.has_init());
    EXPECT_FALSE(model.find("U")->has_init());
}

// Tokens.

TEST(PlanTokens, ANameHasANumberInEachOfItsRoles) {
    const plan model = plan_of(
        type("T", in_sequence(element("name=\"a\" type=\"xs:int\"") + element("name=\"E\" type=\"xs:int\"")) +
                      "<xs:attribute name=\"b\" type=\"xs:int\"/>") +
        type("U",
             in_sequence(element("name=\"b\" type=\"xs:int\"") + element("name=\"a\" type=\"xs:int\""))));
    std::vector<std::string> names;
    unsigned number = 14;
    for (const token_plan& token : model.tokens) {
        names.push_back(token.name);
        EXPECT_EQ(token.number, number++);
    }
    EXPECT_EQ(names, (std::vector<std::string>{"a_b", "e_a", "e_E", "e_b"}));
    EXPECT_EQ(model.find("T")->members.at(1).token, "e_a");
    EXPECT_EQ(model.find("U")->members.at(1).token, "e_a");
}

// Choices, groups, families.

TEST(PlanChoice, NoneComesBehindTheOptions) {
    const plan model = plan_of(
        type("T", in_choice(element("name=\"A\" type=\"xs:int\"") + element("name=\"B\" type=\"xs:int\""))));
    EXPECT_EQ(model.find("T")->kind, class_kind::choice);
    EXPECT_EQ(model.find("T")->none_state, 2);
}

const std::string k_members_of_head = element("name=\"Two\" type=\"v:Sub\" substitutionGroup=\"v:Head\"") +
                                      element("name=\"One\" type=\"v:Sub\" substitutionGroup=\"v:Head\"");
const std::string k_types_of_family = type("Root", note("<b:polymorphic/>")) + derived("Sub", "Root");

TEST(PlanGroup, HoldsMembersInOrderOfDeclaration) {
    const plan model = plan_of(
        k_types_of_family + element("name=\"Head\" type=\"v:Root\" abstract=\"true\"") + k_members_of_head);
    const class_plan& group = *model.find("sg_Head");
    EXPECT_EQ(group.kind, class_kind::group);
    EXPECT_EQ(group.head, "Root");
    ASSERT_EQ(group.group.size(), 2u);
    EXPECT_EQ(group.group[0].element, "Two");
    EXPECT_EQ(group.group[1].element, "One");
    EXPECT_EQ(group.group[1].class_name, "Sub");
    EXPECT_EQ(group.group[1].token, "e_One");
    EXPECT_FALSE(group.group[0].is_head);
}

TEST(PlanGroup, TheStateBelowNoneIsNeverSet) {
    const plan model = plan_of(
        k_types_of_family + element("name=\"Head\" type=\"v:Root\" abstract=\"true\"") + k_members_of_head);
    EXPECT_EQ(model.find("sg_Head")->none_state, 3);
}

TEST(PlanGroup, AHeadThatMayOccurIsItsFirstMember) {
    const plan model =
        plan_of(k_members_of_head + k_types_of_family + element("name=\"Head\" type=\"v:Root\""));
    const std::vector<group_member_plan>& group = model.find("sg_Head")->group;
    ASSERT_EQ(group.size(), 3u);
    EXPECT_EQ(group[0].element, "Head");
    EXPECT_TRUE(group[0].is_head);
    EXPECT_FALSE(group[1].is_head);
    EXPECT_EQ(model.find("sg_Head")->none_state, 4);
}

TEST(PlanFamily, EveryTypeOfATreeIsPolymorphicAndHasAnIdentity) {
    const plan model = plan_of(k_types_of_family + element("name=\"E\" type=\"v:Sub\"") + type("Other", ""));
    EXPECT_TRUE(model.find("Root")->polymorphic);
    EXPECT_TRUE(model.find("Sub")->has_identity);
    EXPECT_EQ(model.find("Sub")->identity, "Sub");
    EXPECT_TRUE(model.find("E")->polymorphic);
    EXPECT_FALSE(model.find("E")->has_identity);
    EXPECT_EQ(model.find("E")->identity, "Sub");
    EXPECT_FALSE(model.find("Other")->polymorphic);
    EXPECT_EQ(model.find("Other")->identity, "");
}

TEST(PlanFamily, AFactoryMakesEveryTypeBelowItsOwn) {
    const plan model = plan_of(type("Root", note("<b:polymorphic/>")) + derived("A", "Root") +
                               derived("B", "A") + derived("C", "Root") + element("name=\"E\" type=\"v:C\""));
    EXPECT_EQ(model.find("Root")->factory, (std::vector<std::string>{"A", "B", "C"}));
    EXPECT_EQ(model.find("A")->factory, std::vector<std::string>{"B"});
    EXPECT_TRUE(model.find("B")->factory.empty());
    EXPECT_TRUE(model.find("E")->factory.empty());
}

// Modules.

TEST(PlanModules, ClassesStandInTheModuleOfTheirDeclaration) {
    const plan model = plan_of(type("A", "") + type("B", ""));
    ASSERT_EQ(model.modules.size(), 1u);
    const module_plan& module = model.modules.front();
    EXPECT_EQ(module.name, "small");
    ASSERT_EQ(module.classes.size(), 2u);
    EXPECT_EQ(module.classes[0], &model.classes[0]);
    EXPECT_EQ(module.classes[1]->name, "B");
    EXPECT_TRUE(module.depends_on.empty());
}

TEST(PlanModules, APlanThatMovesKeepsItsClasses) {
    plan model = plan_of(type("A", ""));
    const plan moved = std::move(model);
    EXPECT_EQ(moved.modules.at(0).classes.at(0), &moved.classes.at(0));
}

}  // namespace
