#include <gtest/gtest.h>

#include "reading_paths.h"
#include "runtime/scanner.h"

namespace {

using namespace qbxV2;
using reading_paths::join;

/// Reads the root element's name, runs `act`, and tells what it gave, the reports, and the event that
/// follows.
template <class Act>
std::string after(const std::string& document, Act act) {
    return reading_paths::on_all_paths(document, [&](c_read& source, bool use_runs) {
        std::string log;
        reading_paths::RecordingErrors errors(&log);
        c_xml xml(source, errors, true);
        xml.use_runs(use_runs);
        c_xml_local scope;
        std::string name;
        xml.get_element_name(&scope, &name);
        const bool result = act(xml, name);
        const eqxp_xml_event next = xml.get_element_name(&scope, &name);
        return join({result ? "true" : "false", log, " then ", std::to_string(next), " ", name});
    });
}

std::string skip_rest(const std::string& document) {
    return after(document,
                 [](c_xml& xml, const std::string& name) { return xml.skip_rest_of_element(name); });
}

std::string skip_rest_of_empty(const std::string& document) {
    return after(document,
                 [](c_xml& xml, const std::string& name) { return xml.skip_rest_of_empty_element(name); });
}

TEST(SkipRestOfElement, PassesOverEverythingInIt) {
    EXPECT_EQ(skip_rest("<a/><z/>"), "true then 7 z");
    EXPECT_EQ(skip_rest("<a></a><z/>"), "true then 7 z");
    EXPECT_EQ(
        skip_rest("<a b='>'>x<b><a>&lt;</a><![CDATA[</a>]]></b><!-- </a> --><?p </a>?><c d='/>'/></a><z/>"),
        "true then 7 z");
}

TEST(SkipRestOfElement, AWrongEndTagIsReported) {
    EXPECT_EQ(skip_rest("<a><b></c></a>"),
              "false !1/23@1: Element start tag (b) and end tag (c) do not match then 6 a");
    EXPECT_EQ(skip_rest("<a></b>"),
              "false !1/23@1: Element start tag (a) and end tag (b) do not match then 0 ");
}

TEST(SkipRestOfElement, FailsWhereTheScannerDoes) {
    EXPECT_EQ(skip_rest("<a><b></b>"), "false then 0 ");
    EXPECT_EQ(skip_rest("<a>&u;</a>"), "false then 6 a");
    EXPECT_EQ(skip_rest("<a><b /x></a>"),
              "false !1/12@1: Illegal character(s) after / at end of tag - x then 6 a");
    EXPECT_EQ(skip_rest("<a /x><z/>"),
              "false !1/12@1: Illegal character(s) after / at end of tag - x then 7 z");
}

TEST(SkipRestOfElement, NeedsNoStackForADeepDocument) {
    std::string text;
    constexpr int k_depth = 200000;
    for (int i = 0; i < k_depth; ++i) text += "<a>";
    for (int i = 0; i < k_depth; ++i) text += "</a>";
    c_read_string source(text);
    c_error errors;
    c_xml xml(source, errors, true);
    c_xml_local scope;
    std::string name;
    xml.get_element_name(&scope, &name);
    EXPECT_TRUE(xml.skip_rest_of_element(name));
    EXPECT_EQ(xml.get_element_name(&scope, &name), EQXP_END_OF_MESSAGE);
}

TEST(SkipRestOfEmptyElement, AllowsNoContent) {
    EXPECT_EQ(skip_rest_of_empty("<a b='1'/><z/>"), "true then 7 z");
    EXPECT_EQ(skip_rest_of_empty("<a> \n</a ><z/>"), "true then 7 z");
    EXPECT_EQ(skip_rest_of_empty("<a><b/></a><z/>").substr(0, 5), "false");
    EXPECT_EQ(skip_rest_of_empty("<a>x</a><z/>").substr(0, 5), "false");
}

}  // namespace
