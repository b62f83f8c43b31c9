#include "runtime/pattern.h"

#include <gtest/gtest.h>

#include "runtime/date_time.h"

namespace {

using qbxV2::c_datetime;
using qbxV2::c_pattern;
using qbxV2::c_pattern_null;
using qbxV2::c_regex;
using qbxV2::has_time_and_zone;
using qbxV2::k_date_time_pattern;

struct Verdict {
    const char* why;
    const char* text;
    bool match;
};
void PrintTo(const Verdict& c, std::ostream* os) { *os << c.why << ": '" << c.text << "'"; }

class DateTimePattern : public testing::TestWithParam<Verdict> {};
TEST_P(DateTimePattern, AsksForTimeAndZone) {
    const c_pattern pattern(k_date_time_pattern);
    const std::string text = GetParam().text;
    EXPECT_EQ(pattern.is_match(text), GetParam().match);
    EXPECT_EQ(pattern.is_match(std::wstring(text.begin(), text.end())), GetParam().match);
    EXPECT_EQ(c_regex(k_date_time_pattern).is_match(text), GetParam().match);
}
INSTANTIATE_TEST_SUITE_P(
    Texts, DateTimePattern,
    testing::Values(Verdict{"UTC", "2024-01-15T10:20:30Z", true},
                    Verdict{"an offset", "2024-01-15T10:20:30+01:00", true},
                    Verdict{"no zone", "2024-01-15T10:20:30", false}, Verdict{"no time", "2024-01-15", false},
                    Verdict{"T alone", "T", false}, Verdict{"nothing before T", "T10Z", false},
                    Verdict{"nothing between T and Z", "2024TZ", false},
                    Verdict{"nothing behind the sign", "2024T10+", false}, Verdict{"nothing", "", false}));

TEST(Pattern, IsAnchoredAtBothEnds) {
    const c_pattern pattern("ab");
    EXPECT_TRUE(pattern.is_match(std::string("ab")));
    EXPECT_FALSE(pattern.is_match(std::string("xab")));
    EXPECT_FALSE(pattern.is_match(std::string("abx")));
}

TEST(Pattern, ReadsUtf8) {
    const c_pattern one_character(".");
    EXPECT_TRUE(one_character.is_match(std::string("\xC3\xA9")));
    EXPECT_TRUE(one_character.is_match(std::wstring(1, static_cast<wchar_t>(0xE9))));
    EXPECT_FALSE(one_character.is_match(std::string("ab")));
    const c_pattern cyrillic("\\p{IsCyrillic}+");
    EXPECT_TRUE(cyrillic.is_match(std::string("\xD0\x96")));
    EXPECT_FALSE(cyrillic.is_match(std::string("Z")));
}

TEST(Pattern, TheTextEndsAtAZeroByte) {
    EXPECT_TRUE(c_pattern("ab").is_match(std::string("ab\0c", 4)));
    EXPECT_FALSE(c_pattern(".").is_match(std::string("\0", 1)));
}

TEST(Pattern, ABadExpressionRefusesEveryText) {
    for (const char* expression : {"(", "[a", "a{2", "*"}) {
        testing::internal::CaptureStderr();
        const c_pattern pattern(expression);
        for (const char* text : {"", "a", "(", "[a", "*"}) {
            EXPECT_FALSE(pattern.is_match(std::string(text))) << expression << " " << text;
        }
        EXPECT_FALSE(pattern.is_match(std::wstring()));
        EXPECT_EQ(testing::internal::GetCapturedStderr(), "") << "nothing is reported";
    }
}

TEST(Pattern, AnEmptyExpressionTakesTheEmptyText) {
    EXPECT_TRUE(c_pattern("").is_match(std::string()));
    EXPECT_FALSE(c_pattern("").is_match(std::string("a")));
    EXPECT_TRUE(c_pattern(nullptr).is_match(std::string()));
}

TEST(Pattern, SurvivesBrokenUtf8) {
    const c_pattern pattern(k_date_time_pattern);
    for (const char* text : {"\xFF", "aT\xC3", "aTb\xE2\x82", "\xF0\x9F\x98", "aTb+\x80", "\xC0\x80TbZ"}) {
        testing::internal::CaptureStderr();
        static_cast<void>(pattern.is_match(std::string(text)));
        EXPECT_EQ(testing::internal::GetCapturedStderr(), "");
    }
}

// Intended: the engine gives up on a character that is no UTF-8, and whatever is not a clear "no" is a match.
TEST(Pattern, AFailureOfTheEngineIsAMatch) {
    testing::internal::CaptureStderr();
    EXPECT_TRUE(c_pattern("ab").is_match(std::string("\xFF")));
    EXPECT_TRUE(c_regex(".").is_match("\xC3"));
    EXPECT_TRUE(c_pattern(k_date_time_pattern).is_match(std::string("aT\xFF")));
    EXPECT_EQ(testing::internal::GetCapturedStderr(), "") << "nor is it reported";
}

TEST(PatternNull, TakesEveryText) {
    const c_pattern_null none("ignored");
    EXPECT_TRUE(none.is_match(std::string()));
    EXPECT_TRUE(none.is_match(std::string("anything")));
    EXPECT_TRUE(none.is_match(std::wstring(L"anything")));
    EXPECT_TRUE(c_pattern_null().is_match(std::string("anything")));
}

TEST(HasTimeAndZone, EqualsThePatternOnEveryFormOfDateTime) {
    const c_pattern pattern(k_date_time_pattern);
    int matches = 0;
    int texts = 0;
    for (const std::string year : {"2024", "-2024", "+2024", "0000", "12024", "-123456789"}) {
        for (const std::string date : {"-01-15", "-99-99"}) {
            for (const std::string time : {"T10:20:30", "T99:99:99"}) {
                for (const std::string fraction :
                     {"", ".", ".5", ".12", ".123", ".1234", ".12345", ".123456", ".12345678901234567890"}) {
                    for (const std::string zone : {"", "Z", "+00:00", "-00:00", "+05:30", "-99:99"}) {
                        std::string text = year;
                        text.append(date).append(time).append(fraction).append(zone);
                        ASSERT_TRUE(c_datetime::is_valid(text)) << text;
                        ASSERT_EQ(has_time_and_zone(text), pattern.is_match(text)) << text;
                        ++texts;
                        matches += has_time_and_zone(text) ? 1 : 0;
                    }
                }
            }
        }
    }
    EXPECT_EQ(texts, 1296);
    EXPECT_EQ(matches, 1080);
}

TEST(HasTimeAndZone, SurvivesShortText) {
    EXPECT_FALSE(has_time_and_zone(""));
    EXPECT_FALSE(has_time_and_zone("Z"));
}

}  // namespace
