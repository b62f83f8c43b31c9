#include "runtime/repository.h"

#include <gtest/gtest.h>

namespace {

using qbxV2::c_repository;

TEST(Repository, ReplacesTheValueOfAKnownKeyInPlace) {
    c_repository<int> numbers;
    numbers.add("a", 1);
    numbers.add("b", 2);
    numbers.add("a", 3);
    ASSERT_EQ(numbers.size(), 2U);
    EXPECT_STREQ(numbers.key_at(0), "a");
    EXPECT_EQ(numbers.value_at(0), 3);
    EXPECT_STREQ(numbers.key_at(1), "b");
}

TEST(Repository, ComparesKeysAsBytes) {
    c_repository<int> numbers;
    numbers.add("Key", 1);
    int value = 0;
    EXPECT_FALSE(numbers.find("key", &value));
    EXPECT_FALSE(numbers.find("Ke", &value));
    EXPECT_FALSE(numbers.find("Keys", &value));
    EXPECT_TRUE(numbers.find("Keys", 3, &value));
    EXPECT_EQ(value, 1);
}

TEST(Repository, TheEmptyKeyIsAKey) {
    c_repository<int> numbers;
    int value = 0;
    EXPECT_FALSE(numbers.find("", &value));
    numbers.add("", 7);
    EXPECT_TRUE(numbers.find("", &value));
    EXPECT_EQ(value, 7);
}

TEST(Repository, KeepsItsOwnCopiesOfKeysAndTexts) {
    c_repository<const char*> texts;
    std::string key = "key";
    std::string value = "value";
    texts.add(key.c_str(), value.c_str());
    key = "xxx";
    value = "xxxxx";
    const char* found = nullptr;
    ASSERT_TRUE(texts.find("key", &found));
    EXPECT_STREQ(found, "value");
}

TEST(Repository, ATextMayReplaceItself) {
    c_repository<const char*> texts;
    texts.add("key", "value");
    const char* found = nullptr;
    texts.find("key", &found);
    texts.add("key", found);
    ASSERT_TRUE(texts.find("key", &found));
    EXPECT_STREQ(found, "value");
}

TEST(Repository, ClearEmptiesIt) {
    c_repository<const char*> texts;
    texts.add("key", "value");
    texts.clear();
    EXPECT_TRUE(texts.empty());
    const char* found = nullptr;
    EXPECT_FALSE(texts.find("key", &found));
    texts.add("key", "other");
    ASSERT_TRUE(texts.find("key", &found));
    EXPECT_STREQ(found, "other");
}

TEST(Repository, FindsAndReplacesInALongListToo) {
    c_repository<int> numbers;
    for (int i = 0; i < 1000; ++i) numbers.add(std::to_string(i).c_str(), i);
    for (int i = 0; i < 1000; i += 2) numbers.add(std::to_string(i).c_str(), -i);
    ASSERT_EQ(numbers.size(), 1000U);
    for (int i = 0; i < 1000; ++i) {
        int value = 0;
        ASSERT_TRUE(numbers.find(std::to_string(i).c_str(), &value));
        EXPECT_EQ(value, i % 2 == 0 ? -i : i);
        EXPECT_EQ(numbers.value_at(static_cast<std::size_t>(i)), value);
    }
    int value = 0;
    EXPECT_FALSE(numbers.find("1000", &value));
    numbers.clear();
    EXPECT_FALSE(numbers.find("7", &value));
}

}  // namespace
