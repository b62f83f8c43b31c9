#include "runtime/list_tokeniser.h"

#include <gtest/gtest.h>

#include <vector>

namespace {

using qbxV2::c_xml_list_tokeniser;
using Items = std::vector<std::string>;

Items items_of(const std::string& value) {
    c_xml_list_tokeniser tokeniser(value);
    Items items;
    std::string item;
    while (tokeniser.get(&item)) items.push_back(item);
    return items;
}

TEST(ListTokeniser, CutsAtWhiteSpace) {
    EXPECT_EQ(items_of(""), Items());
    EXPECT_EQ(items_of(" \t\r\n"), Items());
    EXPECT_EQ(items_of(" a  b "), (Items{"a", "b"}));
    EXPECT_EQ(items_of("a"), Items{"a"});
    EXPECT_EQ(items_of("a\tb\nc\rd\ve\ff"), (Items{"a", "b", "c", "d", "e", "f"}));
    EXPECT_EQ(items_of("\xC3\xA9 \xA0"), (Items{"\xC3\xA9", "\xA0"}));
}

TEST(ListTokeniser, WorksOnACopyAndStartsOverWithAnother) {
    std::string value = "a b";
    c_xml_list_tokeniser tokeniser(value);
    value = "x y";
    std::string item;
    ASSERT_TRUE(tokeniser.get(&item));
    EXPECT_EQ(item, "a");
    tokeniser.set("c");
    ASSERT_TRUE(tokeniser.get(&item));
    EXPECT_EQ(item, "c");
    EXPECT_FALSE(tokeniser.get(&item));
    EXPECT_EQ(item, "c") << "left alone at the end";
    EXPECT_FALSE(tokeniser.get(&item));
}

}  // namespace
