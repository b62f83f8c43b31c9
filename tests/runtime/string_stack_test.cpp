#include "runtime/string_stack.h"

#include <gtest/gtest.h>

namespace {

using qbxV2::c_string_stack;
using qbxV2::c_string_stack_node;

TEST(StringStack, HoldsNamesWithTheirNulsWhileTheNodesLive) {
    c_string_stack stack;
    EXPECT_EQ(stack.get_stack_size(), 0U);
    EXPECT_EQ(stack.count(), 0U);
    {
        const c_string_stack_node a(stack, "ab");
        EXPECT_EQ(stack.get_stack_size(), 3U);
        {
            const c_string_stack_node b(stack, "");
            const c_string_stack_node c(stack, std::string(500, 'x'));
            EXPECT_EQ(stack.get_stack_size(), 3U + 1U + 501U);
            EXPECT_EQ(stack.count(), 3U);
            EXPECT_STREQ(a.get_str(), "ab") << "the block may have moved";
            EXPECT_STREQ(b.get_str(), "");
            EXPECT_STREQ(c.get_str(), std::string(500, 'x').c_str());
        }
        EXPECT_EQ(stack.get_stack_size(), 3U);
        EXPECT_EQ(stack.count(), 1U);
    }
    EXPECT_EQ(stack.get_stack_size(), 0U);
    EXPECT_EQ(stack.count(), 0U);
}

TEST(StringStackNode, EqualsTheNameAndNeitherALongerNorAShorterOne) {
    c_string_stack stack;
    const c_string_stack_node node(stack, "name");
    EXPECT_TRUE(node == "name");
    EXPECT_FALSE(node != "name");
    for (const std::string& other : {std::string("nam"), std::string("names"), std::string(),
                                     std::string("Name"), std::string("name\0", 5)}) {
        EXPECT_FALSE(node == other);
        EXPECT_TRUE(node != other);
    }
}

}  // namespace
