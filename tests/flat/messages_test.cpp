#include <gtest/gtest.h>

#include <fstream>
#include <regex>
#include <set>
#include <sstream>

#include "flat/vrl_flat.h"

namespace {

std::string contents_of(const std::string& path) {
    std::ifstream file(path);
    std::ostringstream text;
    text << file.rdbuf();
    return text.str();
}

std::set<std::string> found(const std::string& text, const std::string& pattern) {
    std::set<std::string> all;
    const std::regex form(pattern);
    for (std::sregex_iterator at(text.begin(), text.end(), form), end; at != end; ++at) all.insert((*at)[1]);
    return all;
}

/// The types that references in flat functions name: one message for each, constant or not.
TEST(FlatMessages, AreThreeHundredAndFiftyFive) {
    std::string all;
    for (const char* module : {"color", "color_space", "color_space_specification", "common", "device",
                               "document", "quality_control", "substrate", "values"}) {
        all += contents_of(std::string(VRL_FLAT_GENERATED) + "/" + module + ".cpp");
    }
    // A wrapped line continues with blanks.
    all = std::regex_replace(all, std::regex("\\s+"), " ");
    std::set<std::string> messages;
    for (const std::string& type : found(all, "copy<([A-Za-z0-9_:]+)>\\("))
        messages.insert(type + " const &");
    for (const std::string& type : found(all, "call_with< ?[A-Za-z0-9_:]+, ([A-Za-z0-9_:]+) const>")) {
        const bool renamed = type == "qbxV2::c_datetime" || type == "qbxV2::c_binary";
        messages.insert((renamed ? "qbxV2::t" + type.substr(7) : type) + " const &");
    }
    for (const std::string& type : found(all, "call_with< ?[A-Za-z0-9_:]+, ([A-Za-z0-9_:]+)>"))
        messages.insert(type + " &");
    for (const std::string& type : found(all, "swap_values<([A-Za-z0-9_:]+)>")) messages.insert(type + " &");
    EXPECT_EQ(messages.size(), 355U);
}

}  // namespace
