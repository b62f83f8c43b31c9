#include "runtime/text_checks.h"

#include <gtest/gtest.h>

#include <climits>
#include <random>

namespace {

using namespace qbxV2;

struct Verdict {
    const char* why;
    std::string text;
    bool valid;
};
void PrintTo(const Verdict& c, std::ostream* os) { *os << c.why << ": '" << c.text << "'"; }

class IsValidBool : public testing::TestWithParam<Verdict> {};
TEST_P(IsValidBool, TakesFourTexts) {
    const std::string& text = GetParam().text;
    EXPECT_EQ(is_valid_bool(text), GetParam().valid);
    EXPECT_EQ(is_valid_bool(text.data(), text.size()), GetParam().valid);
}
INSTANTIATE_TEST_SUITE_P(Texts, IsValidBool,
                         testing::Values(Verdict{"a word", "true", true}, Verdict{"a word", "false", true},
                                         Verdict{"a digit", "1", true}, Verdict{"a digit", "0", true},
                                         Verdict{"case matters", "True", false},
                                         Verdict{"case matters", "FALSE", false},
                                         Verdict{"no blank before", " true", false},
                                         Verdict{"no blank behind", "0 ", false},
                                         Verdict{"nothing", "", false}, Verdict{"another digit", "2", false},
                                         Verdict{"a zero byte", std::string("1\0", 2), false}));

class IsValidInteger : public testing::TestWithParam<Verdict> {};
TEST_P(IsValidInteger, TakesASignAndDigits) {
    const std::string& text = GetParam().text;
    EXPECT_EQ(is_valid_integer(text), GetParam().valid);
    EXPECT_EQ(is_valid_integer(text.data(), text.size()), GetParam().valid);
}
INSTANTIATE_TEST_SUITE_P(
    Texts, IsValidInteger,
    testing::Values(Verdict{"plus", "+0", true}, Verdict{"minus and zeros", "-007", true},
                    Verdict{"no range", "123456789012345678901234567890", true},
                    Verdict{"nothing", "", false}, Verdict{"a sign alone", "+", false},
                    Verdict{"a sign alone", "-", false}, Verdict{"two signs", "--1", false},
                    Verdict{"a point", "1.0", false}, Verdict{"an exponent", "1e5", false},
                    Verdict{"a blank before", " 1", false}, Verdict{"a blank behind", "1 ", false},
                    Verdict{"a top bit", "1\xB2", false},
                    // Intended: the scan ends at the first zero byte.
                    Verdict{"a zero byte ends it", std::string("12\0ab", 5), true},
                    Verdict{"a zero byte ends it", std::string("\0001", 2), false}));

class IsValidFloat : public testing::TestWithParam<Verdict> {};
TEST_P(IsValidFloat, AcceptsExactlyTheDocumentedForms) {
    const std::string& text = GetParam().text;
    EXPECT_EQ(is_valid_float(text), GetParam().valid);
    EXPECT_EQ(is_valid_float(text.data(), text.size()), GetParam().valid);
}
INSTANTIATE_TEST_SUITE_P(
    Texts, IsValidFloat,
    testing::Values(
        Verdict{"a name", "INF", true}, Verdict{"a name", "-INF", true}, Verdict{"a name", "NaN", true},
        Verdict{"no plus before a name", "+INF", false}, Verdict{"case matters", "inf", false},
        Verdict{"case matters", "nan", false}, Verdict{"no sign before NaN", "-NaN", false},
        Verdict{"no rest behind a name", "INFINITY", false}, Verdict{"an exponent", "1e5", true},
        Verdict{"a signed exponent", "1E+5", true},
        Verdict{"digits behind the point suffice", "-.5E-3", true},
        Verdict{"digits before the point suffice", "+1.", true}, Verdict{"whole", "1", true},
        Verdict{"point last", "1.", true}, Verdict{"point first", ".5", true}, Verdict{"both", "1.5", true},
        Verdict{"no range", "1e999", true}, Verdict{"no digit", ".", false}, Verdict{"nothing", "", false},
        Verdict{"a sign alone", "-", false}, Verdict{"a sign and a point", "+.", false},
        Verdict{"an exponent needs digits", "1e", false}, Verdict{"an exponent needs digits", "1e+", false},
        Verdict{"an exponent needs a mantissa", "e5", false}, Verdict{"blanks", " 1", false},
        Verdict{"blanks", "1 ", false}, Verdict{"two points", "1.2.3", false},
        Verdict{"a point in the exponent", "1e5.0", false}, Verdict{"two signs", "+-1", false},
        Verdict{"hexadecimal", "0x1", false}, Verdict{"a zero byte", std::string("1\0", 2), false}));

struct Measure {
    const char* why;
    std::string text;
    unsigned int count;
};
void PrintTo(const Measure& c, std::ostream* os) { *os << c.why; }

class Length : public testing::TestWithParam<Measure> {};
TEST_P(Length, CountsCharactersByLeadBytes) { EXPECT_EQ(length(GetParam().text), GetParam().count); }
INSTANTIATE_TEST_SUITE_P(
    Texts, Length,
    testing::Values(Measure{"nothing", "", 0}, Measure{"ASCII", "abc", 3},
                    Measure{"a zero byte counts", std::string("a\0b", 3), 3},
                    Measure{"two bytes", "\xC3\xA9x", 2}, Measure{"three bytes", "\xE2\x82\xACx", 2},
                    Measure{"four bytes", "\xF0\x9F\x98\x80x", 2},
                    Measure{"a continuation byte is counted and ends the count",
                            "\x80"
                            "abc",
                            1},
                    Measure{"the same later",
                            "ab\xBF"
                            "cd",
                            3},
                    Measure{"0xF8 is counted and ends the count",
                            "\xF8"
                            "abc",
                            1},
                    Measure{"surrogates of three bytes each are one", "\xED\xA0\xBD\xED\xB8\x80x", 2},
                    Measure{"0xED without a surrogate steps three", "\xED\x9F\xBFx", 2},
                    Measure{"0xED at the end steps three", "a\xED", 2},
                    Measure{"a surrogate without partner swallows what follows", "\xED\xA0\xBDxyz!", 2},
                    Measure{"a sequence cut off counts", "a\xF0", 2}));

TEST(IsMaxLengthOk, SizeDecidesWhereItCan) {
    EXPECT_TRUE(is_max_length_ok("", 0));
    EXPECT_TRUE(is_max_length_ok("abc", 3));
    EXPECT_FALSE(is_max_length_ok("abcd", 3));
    // No character begins with these bytes; by their number alone they are short enough, or too long.
    EXPECT_TRUE(is_max_length_ok("\x80\x80\x80", 3));
    EXPECT_FALSE(is_max_length_ok("\x80\x80\x80\x80\x80", 1));
    EXPECT_TRUE(is_max_length_ok("\x80\x80\x80\x80", 1));
}

TEST(IsMaxLengthOk, CharactersDecideBetween) {
    const std::string five_bytes = "\xF0\x9F\x98\x80x";
    EXPECT_TRUE(is_max_length_ok(five_bytes, 2));
    EXPECT_FALSE(is_max_length_ok(five_bytes, 1));
    EXPECT_FALSE(is_max_length_ok("x", 0));
    EXPECT_TRUE(is_max_length_ok(five_bytes, UINT_MAX));
}

TEST(IsMinLengthOk, SizeDecidesWhereItCan) {
    EXPECT_TRUE(is_min_length_ok("", 0));
    EXPECT_FALSE(is_min_length_ok("", 1));
    EXPECT_TRUE(is_min_length_ok("\x80\x80\x80\x80", 1));
    EXPECT_TRUE(is_min_length_ok("\x80\x80\x80\x80\x80\x80\x80\x80", 2));
    EXPECT_FALSE(is_min_length_ok("\x80\x80\x80\x80\x80\x80\x80", 2));
}

TEST(IsMinLengthOk, CharactersDecideBetween) {
    EXPECT_TRUE(is_min_length_ok("abc", 3));
    EXPECT_FALSE(is_min_length_ok("abc", 4));
    EXPECT_FALSE(is_min_length_ok("\xE2\x82\xAC\xE2\x82\xAC", 3));
    EXPECT_FALSE(is_min_length_ok("abc", UINT_MAX));
}

TEST(LengthChecks, AgreeWithLengthOnSoundText) {
    const std::string pieces[] = {"a", "\xC3\xA9", "\xE2\x82\xAC", "\xF0\x9F\x98\x80"};
    std::mt19937 random(2);
    for (int round = 0; round < 2000; ++round) {
        std::string text;
        for (auto i = random() % 10; i > 0; --i) text += pieces[random() % 4];
        for (unsigned int limit = 0; limit < 12; ++limit) {
            ASSERT_EQ(is_min_length_ok(text, limit), length(text) >= limit) << text << limit;
            ASSERT_EQ(is_max_length_ok(text, limit), length(text) <= limit) << text << limit;
        }
    }
}

struct Digits {
    std::string text;
    int total;
    int fraction;
};
void PrintTo(const Digits& c, std::ostream* os) { *os << "'" << c.text << "'"; }

class DigitCounts : public testing::TestWithParam<Digits> {};
TEST_P(DigitCounts, CountWhatIsWritten) {
    EXPECT_EQ(total_digits(GetParam().text), GetParam().total);
    EXPECT_EQ(fraction_digits(GetParam().text), GetParam().fraction);
}
INSTANTIATE_TEST_SUITE_P(Texts, DigitCounts,
                         testing::Values(Digits{"", 0, 0}, Digits{"-00.10", 4, 2}, Digits{"12.", 2, 0},
                                         Digits{"1.5e3", 3, 2}, Digits{"12", 2, 0}, Digits{".", 0, 0},
                                         Digits{".5", 1, 1}, Digits{"1.2.3", 3, 2}, Digits{"a1b2", 2, 0},
                                         Digits{"\xB2\xB3.\xB9", 0, 0}));

}  // namespace
