#include "runtime/utf8.h"

#include <gtest/gtest.h>

#include <cstring>
#include <string>

namespace {

using namespace qbxV2;

/// The range of second bytes that a lead byte admits; the whole range where the second byte is not looked at.
struct LeadBytes {
    unsigned first;
    unsigned last;
    unsigned second_first;
    unsigned second_last;
};
constexpr unsigned k_none = 256;
constexpr LeadBytes k_table[] = {
    {0x00, 0x7F, 0, 255}, {0x80, 0xC1, k_none, 0},  {0xC2, 0xDF, 0, 255},    {0xE0, 0xE0, 0xA0, 0xBF},
    {0xE1, 0xEC, 0, 255}, {0xED, 0xED, 0x80, 0x9F}, {0xEE, 0xEF, 0, 255},    {0xF0, 0xF0, 0x90, 0xBF},
    {0xF1, 0xF3, 0, 255}, {0xF4, 0xF4, 0x80, 0x8F}, {0xF5, 0xFF, k_none, 0},
};

TEST(IsValidUtf8CharSequence, FollowsItsTableForEveryPairOfBytes) {
    for (const LeadBytes& row : k_table) {
        for (unsigned lead = row.first; lead <= row.last; ++lead) {
            for (unsigned second = 0; second < 256; ++second) {
                const char bytes[] = {static_cast<char>(lead), static_cast<char>(second), 0};
                EXPECT_EQ(is_valid_utf8_char_sequence(bytes),
                          second >= row.second_first && second <= row.second_last)
                    << lead << " " << second;
            }
        }
    }
}

TEST(IsValidUtf8CharSequence, DoesNotLookAtTheThirdAndFourthByte) {
    EXPECT_TRUE(is_valid_utf8_char_sequence("\xE0\xA0x"));
    EXPECT_TRUE(is_valid_utf8_char_sequence("\xF0\x90xy"));
}

struct CodePoint {
    int code;
    const char* bytes;
};
void PrintTo(const CodePoint& c, std::ostream* os) { *os << c.code; }

class Utf8Form : public testing::TestWithParam<CodePoint> {};

TEST_P(Utf8Form, IsWrittenAndReadBack) {
    char buffer[5];
    EXPECT_EQ(unicode_char_to_utf8(GetParam().code, buffer), buffer);
    EXPECT_STREQ(buffer, GetParam().bytes);
    int code = -2;
    EXPECT_TRUE(utf8_to_unicode_char(buffer, &code));
    EXPECT_EQ(code, GetParam().code);
}

INSTANTIATE_TEST_SUITE_P(EndsOfEachLength, Utf8Form,
                         testing::Values(CodePoint{1, "\x01"}, CodePoint{0x7F, "\x7F"},
                                         CodePoint{0x80, "\xC2\x80"}, CodePoint{0x7FF, "\xDF\xBF"},
                                         CodePoint{0x800, "\xE0\xA0\x80"}, CodePoint{0xD800, "\xED\xA0\x80"},
                                         CodePoint{0xFFFF, "\xEF\xBF\xBF"},
                                         CodePoint{0x10000, "\xF0\x90\x80\x80"},
                                         CodePoint{0x10FFFF, "\xF4\x8F\xBF\xBF"},
                                         CodePoint{0x110000, "\xF4\x90\x80\x80"}));

TEST(UnicodeCharToUtf8, NulIsTheEmptyText) {
    char buffer[5] = "xxx";
    EXPECT_STREQ(unicode_char_to_utf8(0, buffer), "");
}

TEST(Utf8ToUnicodeChar, AByteThatLeadsNoSequenceGivesMinusOneAndFalse) {
    for (std::string bytes : {"\x80", "\xBF", "\xF8\x88\x80\x80\x80", "\xFF"}) {
        int code = 0;
        EXPECT_FALSE(utf8_to_unicode_char(bytes.data(), &code));
        EXPECT_EQ(code, -1);
    }
}

TEST(Utf8ToUnicodeChar, AMissingContinuationGivesFalse) {
    for (std::string bytes : {"\xC3", "\xC3x", "\xE2\x82", "\xE2\x82x", "\xF0\x9F\x98", "\xF0\x9F\x98x"}) {
        int code = 0;
        EXPECT_FALSE(utf8_to_unicode_char(bytes.data(), &code)) << bytes;
    }
}

TEST(Utf8ToUnicodeChar, OverlongFormsPass) {
    char bytes[] = "\xC0\xBC";
    int code = 0;
    EXPECT_TRUE(utf8_to_unicode_char(bytes, &code));
    EXPECT_EQ(code, '<');
}

TEST(Bswap, ExchangesTheBytesOfTwoBuffers) {
    char a[] = "abcd";
    char b[] = "wxyz";
    bswap(a, b, 3);
    EXPECT_STREQ(a, "wxyd");
    EXPECT_STREQ(b, "abcz");
    bswap(a, b, 0);
    EXPECT_STREQ(a, "wxyd");
}

}  // namespace
