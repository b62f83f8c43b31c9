#include <gtest/gtest.h>

#include "reading_paths.h"
#include "runtime/xml_reader.h"

// Input that is large or twisted in one way, of a size at which anything worse than linear work would not end
// in time.

namespace {

using namespace qbxV2;
using reading_paths::join;

std::string numbered(const char* before, int i, const char* behind) {
    return join({before, std::to_string(i), behind});
}

/// A scanner behind the name of the first element of a text.
struct AtElement {
    explicit AtElement(std::string document)
        : text(std::move(document)), source(text), errors(&log), xml(source, errors, true) {
        event = xml.get_element_name(&scope, &name);
    }
    std::string text;
    c_read_string source;
    std::string log;
    reading_paths::RecordingErrors errors;
    c_xml xml;
    c_xml_local scope;
    std::string name;
    std::string value;
    eqxp_xml_event event;
};

TEST(HostileInput, AHundredThousandAttributesOnOneTag) {
    std::string text = "<a";
    for (int i = 0; i < 100000; ++i) text += numbered(" b", i, "='1'");
    AtElement at(text + "/>");
    int count = 0;
    while (at.xml.get_attribute_name(&at.name, false) == EQXP_NAME) {
        EXPECT_TRUE(at.xml.get_attribute_value(&at.value, EQBX_WS_COLLAPSE));
        ++count;
    }
    EXPECT_EQ(count, 100000);
}

TEST(HostileInput, AHundredThousandNamespacesOnOneTag) {
    std::string text = "<a";
    for (int i = 0; i < 100000; ++i) text += numbered(" xmlns:p", i, numbered("='u", i, "'").c_str());
    AtElement at(text + "/>");
    EXPECT_EQ(at.event, EQXP_NAME);
    for (int i = 0; i < 100000; i += 7) {
        EXPECT_EQ(at.scope.find_namespace_id(numbered("p", i, "")), 1000 + i);
        EXPECT_EQ(at.xml.find_namespace_from_id(1000 + i), numbered("u", i, ""));
    }
}

TEST(HostileInput, AHundredThousandSiblingsEachWithANamespaceOfItsOwn) {
    std::string text = "<a>";
    for (int i = 0; i < 100000; ++i) text += numbered("<b xmlns:p", i, numbered("='u", i, "'/>").c_str());
    AtElement at(text + "</a>");
    EXPECT_TRUE(at.xml.skip_rest_of_element(at.name));
}

TEST(HostileInput, ATextOf64Megabytes) {
    constexpr std::size_t k_size = std::size_t{64} << 20;
    std::string text = "<a>";
    text.append(k_size, 'x');
    AtElement at(text + "</a>");
    EXPECT_TRUE(at.xml.skip_start_tag(nullptr));
    EXPECT_TRUE(at.xml.get_element_value(&at.value, EQBX_WS_COLLAPSE, true));
    EXPECT_EQ(at.value.size(), k_size);
}

TEST(HostileInput, AMillionWordsInOneText) {
    std::string text = "<a>";
    for (int i = 0; i < 1000000; ++i) text += "x \r\n";
    AtElement at(text + "</a>");
    EXPECT_TRUE(at.xml.skip_start_tag(nullptr));
    EXPECT_TRUE(at.xml.get_element_value(&at.value, EQBX_WS_COLLAPSE, true));
    EXPECT_EQ(at.value.size(), 1999999U);
    EXPECT_EQ(at.xml.get_line_num(), 1000001);
}

TEST(HostileInput, ManyEntities) {
    std::string text = "<!DOCTYPE a [";
    for (int i = 0; i < 30000; ++i) text += numbered("<!ENTITY e", i, numbered(" '", i, "'>").c_str());
    text += "]><a b='&e29999;'>";
    for (int i = 0; i < 30000; ++i) text += numbered("&e", i, ";");
    AtElement at(text + "</a>");
    ASSERT_EQ(at.event, EQXP_NAME);
    EXPECT_EQ(at.xml.get_attribute_name(&at.name, false), EQXP_NAME);
    EXPECT_TRUE(at.xml.get_attribute_value(&at.value, EQBX_WS_PRESERVE));
    EXPECT_EQ(at.value, "29999");
    EXPECT_TRUE(at.xml.skip_start_tag(nullptr));
    EXPECT_TRUE(at.xml.get_element_value(&at.value, EQBX_WS_PRESERVE, true));
    EXPECT_EQ(at.value.size(), 138890U);
}

/// e0 refers to e1, e1 to e2, and so on; the last one is "x".
std::string chain_of_entities(int length, const char* body) {
    std::string text = "<!DOCTYPE a [";
    for (int i = 0; i < length; ++i) {
        text += numbered("<!ENTITY e", i, i + 1 < length ? numbered(" '&e", i + 1, ";'>").c_str() : " 'x'>");
    }
    return join({text, "]>", body});
}

TEST(HostileInput, ALongChainOfEntitiesNeedsNoStack) {
    AtElement in_attribute(chain_of_entities(30000, "<a b='&e0;'/>"));
    in_attribute.xml.get_attribute_name(&in_attribute.name, false);
    EXPECT_TRUE(in_attribute.xml.get_attribute_value(&in_attribute.value, EQBX_WS_PRESERVE));
    EXPECT_EQ(in_attribute.value, "x");
    AtElement in_content(chain_of_entities(30000, "<a>&e0;</a>"));
    in_content.xml.skip_start_tag(nullptr);
    EXPECT_TRUE(in_content.xml.get_element_value(&in_content.value, EQBX_WS_PRESERVE, true));
    EXPECT_EQ(in_content.value, "x");
}

/// Each entity refers ten times to the next one: 10 to the power of `levels` times "x".
std::string laughs(int levels, const char* body) {
    std::string text = "<!DOCTYPE a [<!ENTITY l0 'x'>";
    for (int i = 1; i <= levels; ++i) {
        text += numbered("<!ENTITY l", i, " '");
        for (int n = 0; n < 10; ++n) text += numbered("&l", i - 1, ";.");
        text += "'>";
    }
    return join({text, "]>", body});
}

TEST(HostileInput, EntitiesThatMultiplyEndAtTheLimit) {
    constexpr std::size_t k_limit = 1000000;
    const std::string report = " !0/9@1: Entity expansion exceeds the limit of 1000000 bytes";
    AtElement in_attribute(laughs(12, "<a b='&l12;'/>"));
    in_attribute.xml.set_max_entity_expansion(k_limit);
    in_attribute.xml.get_attribute_name(&in_attribute.name, false);
    EXPECT_FALSE(in_attribute.xml.get_attribute_value(&in_attribute.value, EQBX_WS_PRESERVE));
    EXPECT_EQ(in_attribute.log, report);
    AtElement in_content(laughs(12, "<a>&l12;</a>"));
    in_content.xml.set_max_entity_expansion(k_limit);
    in_content.xml.skip_start_tag(nullptr);
    EXPECT_FALSE(in_content.xml.get_element_value(&in_content.value, EQBX_WS_PRESERVE, true));
    EXPECT_EQ(in_content.log, report);
}

TEST(HostileInput, ParameterEntitiesThatKeepRedefiningOneAnotherEndAtTheLimit) {
    // c defines itself anew from d, and then reads the new definition.
    const std::string text =
        "<!DOCTYPE a [<!ENTITY % d \"<!ENTITY &#38;#37; c '&#38;#37;d;'>&#38;#37;c;\">"
        "<!ENTITY % c '%d;'>%c;]><a/>";
    c_read_string source(text);
    std::string log;
    reading_paths::RecordingErrors errors(&log);
    c_xml xml(source, errors, true);
    xml.set_max_entity_expansion(100000);
    c_xml_local scope;
    std::string name;
    EXPECT_EQ(xml.get_element_name(&scope, &name), EQXP_ERROR);
    EXPECT_EQ(log, " !0/9@1: Entity expansion exceeds the limit of 100000 bytes");
    EXPECT_EQ(xml.get_element_name(&scope, &name), EQXP_END_OF_MESSAGE);
}

TEST(HostileInput, ManyCommentsAndInstructions) {
    std::string text;
    for (int i = 0; i < 200000; ++i) text += "<!---->\n<?x?>\n";
    AtElement at(text + "<a/>");
    EXPECT_EQ(at.event, EQXP_NAME);
    EXPECT_EQ(at.xml.get_line_num(), 400001);
}

TEST(HostileInput, NothingButOpeningBrackets) {
    AtElement at(std::string(500000, '<'));
    EXPECT_EQ(at.event, EQXP_ERROR);
    EXPECT_EQ(at.xml.get_element_name(&at.scope, &at.name), EQXP_END_OF_MESSAGE);
}

}  // namespace
