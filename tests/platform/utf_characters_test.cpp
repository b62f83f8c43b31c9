#include "platform/utf_characters.h"

#include <gtest/gtest.h>

namespace {

using namespace vrl_platform;

TEST(Utf16Units, SurrogatesAreTwoRanges) {
    EXPECT_FALSE(is_high_surrogate(0xD7FF));
    EXPECT_TRUE(is_high_surrogate(0xD800) && is_high_surrogate(0xDBFF));
    EXPECT_FALSE(is_high_surrogate(0xDC00));
    EXPECT_FALSE(is_low_surrogate(0xDBFF));
    EXPECT_TRUE(is_low_surrogate(0xDC00) && is_low_surrogate(0xDFFF));
    EXPECT_FALSE(is_low_surrogate(0xE000));
}

TEST(Utf16Units, APairIsACharacterAbove16Bits) {
    EXPECT_EQ(from_surrogates(0xD800, 0xDC00), 0x10000U);
    EXPECT_EQ(from_surrogates(0xD83D, 0xDE00), 0x1F600U);
    EXPECT_EQ(from_surrogates(0xDBFF, 0xDFFF), 0x10FFFFU);
}

TEST(AppendUtf8, ChangesLengthAtTheBounds) {
    const std::pair<std::uint32_t, const char*> table[] = {{0x7F, "\x7F"},
                                                           {0x80, "\xC2\x80"},
                                                           {0x7FF, "\xDF\xBF"},
                                                           {0x800, "\xE0\xA0\x80"},
                                                           {0xD800, "\xED\xA0\x80"},
                                                           {0xFFFF, "\xEF\xBF\xBF"},
                                                           {0x10000, "\xF0\x90\x80\x80"},
                                                           {0x10FFFF, "\xF4\x8F\xBF\xBF"}};
    for (const auto& [code, bytes] : table) {
        std::string out = "x";
        append_utf8(out, code);
        EXPECT_EQ(out, std::string("x") + bytes) << code;
    }
}

TEST(AppendUtf8, CutsOffWhatIsNoCharacter) {
    std::string out;
    append_utf8(out, 0xFFFFFFFF);
    EXPECT_EQ(out, "\xF7\xBF\xBF\xBF");
}

}  // namespace
