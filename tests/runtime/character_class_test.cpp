#include "runtime/character_class.h"

#include <gtest/gtest.h>

#include <cctype>
#include <clocale>

namespace {

using namespace qbxV2::detail;

TEST(CharacterClass, EqualsTheCLibraryInTheCLocale) {
    ASSERT_STREQ(std::setlocale(LC_ALL, nullptr), "C");
    for (int c = 0; c < 256; ++c) {
        const auto byte = static_cast<unsigned char>(c);
        EXPECT_EQ(byte_is(byte, cc_space), std::isspace(c) != 0) << c;
        EXPECT_EQ(byte_is(byte, cc_digit), std::isdigit(c) != 0) << c;
        EXPECT_EQ(byte_is(byte, cc_hex), std::isxdigit(c) != 0) << c;
        const bool marked_start = c == '_' || c == ':' || c >= 0x80;
        EXPECT_EQ(byte_is(byte, cc_name_start), std::isalpha(c) != 0 || marked_start) << c;
        EXPECT_EQ(byte_is(byte, cc_name), std::isalnum(c) != 0 || marked_start || c == '.' || c == '-') << c;
        EXPECT_EQ(byte_is(byte, cc_plain_name), byte_is(byte, cc_name) && c < 0x80) << c;
        const bool printable = (c >= 0x20 && c < 0x7F) || c == '\t';
        EXPECT_EQ(byte_is(byte, cc_text), printable && c != '<' && c != '&') << c;
        EXPECT_EQ(byte_is(byte, cc_value), printable && c != '"' && c != '\'') << c;
    }
}

TEST(CharacterClass, TheEndAndNegativeValuesOfEntityTextAreInNoClass) {
    for (const int c : {-1, -128, -61}) {
        EXPECT_FALSE(is_space(c));
        EXPECT_FALSE(is_name_start(c));
        EXPECT_FALSE(is_name_char(c));
    }
}

}  // namespace
