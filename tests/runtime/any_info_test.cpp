#include "runtime/any_info.h"

#include <gtest/gtest.h>

namespace {

using qbxV2::c_any_info;

void expect_parts(const c_any_info& info, const char* uri, const char* name, const char* value) {
    EXPECT_EQ(info.get_namespace(), uri);
    EXPECT_EQ(info.get_name(), name);
    EXPECT_EQ(info.get_value(), value);
}

TEST(AnyInfo, TakesItsPartsInOrder) {
    expect_parts(c_any_info(), "", "", "");
    expect_parts(c_any_info("urn:x"), "urn:x", "", "");
    expect_parts(c_any_info("urn:x", "note"), "urn:x", "note", "");
    expect_parts(c_any_info("urn:x", "note", "<note/>"), "urn:x", "note", "<note/>");
}

TEST(AnyInfo, SettersTouchOnePartEach) {
    c_any_info info("urn:x", "note", "<note/>");
    info.set_name("n");
    expect_parts(info, "urn:x", "n", "<note/>");
    info.set_namespace("u");
    expect_parts(info, "u", "n", "<note/>");
    info.set_value("v");
    expect_parts(info, "u", "n", "v");
}

}  // namespace
