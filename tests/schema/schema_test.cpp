#include <gtest/gtest.h>
#include <libxml/parser.h>

#include <cstring>
#include <fstream>
#include <functional>
#include <memory>
#include <set>
#include <sstream>
#include <string>
#include <vector>

#include "tests/schema/document_judge.h"

namespace schema_tests {
namespace {

const char* const k_modules[] = {"common",    "device", "color_space_specification", "color_space",
                                 "substrate", "color",  "quality_control",           "document"};

using dom = std::unique_ptr<xmlDoc, void (*)(xmlDoc*)>;

dom parse(const std::string& module) {
    return dom(xmlReadFile(schema_file(module + ".xsd").c_str(), nullptr, 0), &xmlFreeDoc);
}

std::string attribute(const xmlNode* node, const char* name) {
    xmlChar* value = xmlGetNoNsProp(node, reinterpret_cast<const xmlChar*>(name));
    std::string text = value == nullptr ? "" : reinterpret_cast<const char*>(value);
    xmlFree(value);
    return text;
}

// A document node has no name.
std::string name_of(const xmlNode* node) {
    return node->name == nullptr ? "" : reinterpret_cast<const char*>(node->name);
}

std::string namespace_of(const xmlNode* node) {
    return node->ns == nullptr ? "" : reinterpret_cast<const char*>(node->ns->href);
}

void for_each_element(const xmlNode* node, const std::function<void(const xmlNode*)>& visit) {
    if (node->type != XML_ELEMENT_NODE) return;
    visit(node);
    for (const xmlNode* child = node->children; child != nullptr; child = child->next) {
        for_each_element(child, visit);
    }
}

void for_each_element(const std::function<void(const std::string&, const xmlNode*)>& visit) {
    for (const char* module : k_modules) {
        const dom document = parse(module);
        ASSERT_NE(document, nullptr) << module;
        for_each_element(xmlDocGetRootElement(document.get()),
                         [&](const xmlNode* node) { visit(module, node); });
    }
}

bool is_documented(const xmlNode* node) {
    for (const xmlNode* child = node->children; child != nullptr; child = child->next) {
        if (child->type != XML_ELEMENT_NODE || name_of(child) != "annotation") continue;
        for (const xmlNode* part = child->children; part != nullptr; part = part->next) {
            if (part->type == XML_ELEMENT_NODE && name_of(part) == "documentation") return true;
        }
    }
    return false;
}

TEST(Schema, CompilesAsAWhole) { EXPECT_EQ(complaints_about_schema("vrl.xsd"), ""); }

TEST(Schema, ModulesCompileAlone) {
    for (const char* module : k_modules) {
        // Substrates and colors contain each other; a module can't include both ways.
        if (std::strcmp(module, "substrate") == 0) continue;
        EXPECT_EQ(complaints_about_schema(std::string(module) + ".xsd"), "");
    }
}

TEST(Schema, EveryTypeElementAndAttributeIsDocumented) {
    for_each_element([](const std::string& module, const xmlNode* node) {
        const std::string kind = name_of(node);
        const bool global = name_of(node->parent) == "schema";
        const bool reference = !attribute(node, "ref").empty();
        const bool row = (kind == "element" || kind == "attribute") && !global && !reference;
        // An anonymous restriction is told by its element.
        const bool type = kind == "complexType" || (kind == "simpleType" && global);
        if (row || type) {
            EXPECT_TRUE(is_documented(node))
                << module << ".xsd:" << xmlGetLineNo(node) << ": " << kind << " " << attribute(node, "name");
        }
    });
}

TEST(Schema, ReadmeListsExactlyTheAnnotationsInUse) {
    std::set<std::string> used;
    for_each_element([&used](const std::string&, const xmlNode* node) {
        if (namespace_of(node) == "urn:vrl:codegen") used.insert(name_of(node));
    });

    std::set<std::string> listed;
    std::ifstream readme(schema_file("README.md"));
    ASSERT_TRUE(readme.is_open());
    const std::string row = "| `<b:";
    for (std::string line; std::getline(readme, line);) {
        if (line.compare(0, row.size(), row) != 0) continue;
        listed.insert(line.substr(row.size(), line.find_first_of(" /", row.size()) - row.size()));
    }
    EXPECT_EQ(used, listed);
}

struct group {
    const char* head;
    const char* members;  ///< in the order of their numbers, from 0, without the head's name
};

void PrintTo(const group& g, std::ostream* out) { *out << g.head; }

class SubstitutionGroup : public testing::TestWithParam<group> {};

std::string head_of(const testing::TestParamInfo<group>& info) { return info.param.head; }

// The position of a member is its number in memory and in the flat interface.
TEST_P(SubstitutionGroup, MembersStandTogetherInTheOrderOfTheirNumbers) {
    const std::string head = GetParam().head;
    std::vector<std::string> expected{head};
    std::istringstream members(GetParam().members);
    for (std::string member; members >> member;) expected.push_back(head + member);

    std::vector<std::string> found;
    for (const char* module : k_modules) {
        const dom document = parse(module);
        ASSERT_NE(document, nullptr);
        bool ended = false;
        for (const xmlNode* node = xmlDocGetRootElement(document.get())->children; node != nullptr;
             node = node->next) {
            if (node->type != XML_ELEMENT_NODE) continue;
            const std::string name = attribute(node, "name");
            const bool is_head = name_of(node) == "element" && name == head;
            if (is_head || attribute(node, "substitutionGroup") == "vrl:" + head) {
                EXPECT_FALSE(ended) << name << " stands apart";
                found.push_back(name);
            } else if (!found.empty()) {
                ended = true;
            }
        }
    }
    EXPECT_EQ(found, expected);
}

INSTANTIATE_TEST_SUITE_P(
    All, SubstitutionGroup,
    testing::Values(
        group{
            "ColorSpace",
            "Recipe TINTARA Generic EmissiveGeneric Density RGB SRGB AdobeRGB AdobeWideGamutRGB Spectral "
            "EmissiveSpectral CIELab CIELCh CIEXYZ EmissiveCIEXYZ CIExyY EmissiveCIExyY CIELuv HSL HSV CMYK "
            "TINTARAQuadravive YUV YIQ YBR NCS Munsell"},
        group{"Substrate", "Paper Generic Metal Plastic Wood Vinyl Tile Film Textile"},
        group{"Sample", "Spot Target"},
        group{"Function",
              "Generic DE MeanDE DE94 DE2000 DECMC StdDevX StdDevY StdDevZ StdDevL StdDevA StdDevB "
              "StdDevC StdDevH AverageStdDevL AverageStdDevA AverageStdDevB"}),
    &head_of);

}  // namespace
}  // namespace schema_tests
