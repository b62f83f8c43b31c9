#include "runtime/duration.h"

#include <gtest/gtest.h>

#include <climits>
#include <iomanip>
#include <limits>
#include <locale>
#include <sstream>
#include <vector>

namespace {

using qbxV2::c_duration;

struct Verdict {
    const char* why;
    const char* text;
    bool valid;
};
void PrintTo(const Verdict& c, std::ostream* os) { *os << c.why << ": '" << c.text << "'"; }

class DurationIsValid : public testing::TestWithParam<Verdict> {};
TEST_P(DurationIsValid, FollowsTheOrderOfTheLetters) {
    const std::string text = GetParam().text;
    EXPECT_EQ(c_duration::is_valid(text), GetParam().valid);
    EXPECT_EQ(c_duration::is_valid(text.c_str()), GetParam().valid);
    const std::vector<char> block(text.begin(), text.end());
    EXPECT_EQ(c_duration::is_valid(block.data(), block.size()), GetParam().valid);
}
INSTANTIATE_TEST_SUITE_P(
    Texts, DurationIsValid,
    testing::Values(
        Verdict{"everything", "-P1Y2M3DT4H5M6S", true}, Verdict{"a plus", "+P1Y", true},
        Verdict{"P alone", "P", true}, Verdict{"signed P alone", "-P", true}, Verdict{"months", "P1M", true},
        Verdict{"minutes", "PT1M", true}, Verdict{"days", "P1D", true},
        Verdict{"years and days", "P1Y3D", true}, Verdict{"hours", "PT1H", true},
        Verdict{"seconds", "PT1S", true}, Verdict{"a fraction", "PT1.5S", true},
        Verdict{"a fraction without digits", "PT1.S", true}, Verdict{"a fraction alone", "PT.5S", true},
        Verdict{"hours and a fraction alone", "PT1H.5S", true}, Verdict{"hours and seconds", "PT1H5S", true},
        Verdict{"many digits", "P12345678901234567890Y", true}, Verdict{"nothing", "", false},
        Verdict{"no P", "1Y", false}, Verdict{"two signs", "--P1Y", false}, Verdict{"small p", "p1Y", false},
        Verdict{"a number without letter", "P1", false}, Verdict{"a number without letter", "P1Y2", false},
        Verdict{"a letter without number", "PY", false}, Verdict{"nothing behind T", "PT", false},
        Verdict{"nothing behind T", "P1YT", false}, Verdict{"a number without letter", "PT1", false},
        Verdict{"wrong order", "P1M1Y", false}, Verdict{"wrong order", "P1D1M", false},
        Verdict{"wrong order", "PT1M1H", false}, Verdict{"wrong order", "PT1S1M", false},
        Verdict{"time without T", "P1H", false}, Verdict{"date behind T", "PT1D", false},
        Verdict{"a point and no more", "PT1.", false}, Verdict{"a point and no more", "PT.", false},
        Verdict{"a point without digits", "PT.S", false}, Verdict{"a fraction of hours", "PT1.5H", false},
        Verdict{"a fraction of a year", "P1.5Y", false}, Verdict{"a fraction without S", "PT1.5", false},
        Verdict{"a letter without number", "PTS", false}, Verdict{"a rest", "P1Yx", false},
        Verdict{"a rest", "PT1Sx", false}, Verdict{"a blank", "P1Y ", false},
        // Intended: a number left over before the "T" has no effect beyond still waiting there.
        Verdict{"a number left before T", "P1T1H", true}, Verdict{"its letter behind T", "P1TH", true},
        Verdict{"its letter behind T", "P1TS", true}, Verdict{"left without any letter", "P1T1", false}));

TEST(DurationIsValid, ANullTextIsNotValid) {
    const char* const null = nullptr;
    EXPECT_FALSE(c_duration::is_valid(null));
}

std::string fields(const c_duration& d) {
    std::ostringstream os;
    os << (d.get_is_neg() ? "-" : "") << d.get_years() << ' ' << d.get_months() << ' ' << d.get_days() << ' '
       << d.get_hours() << ' ' << d.get_mins() << ' ' << d.get_secs();
    return os.str();
}

struct Parsed {
    const char* why;
    const char* text;
    const char* fields;
};
void PrintTo(const Parsed& c, std::ostream* os) { *os << c.why << ": '" << c.text << "'"; }

class DurationParsing : public testing::TestWithParam<Parsed> {};
TEST_P(DurationParsing, StoresEachNumberThatMeetsItsLetter) {
    const std::string text = GetParam().text;
    EXPECT_EQ(fields(c_duration(text)), GetParam().fields);
    EXPECT_EQ(fields(c_duration(text.c_str())), GetParam().fields);
    c_duration value("-P9Y9M9DT9H9M9S");
    value = text;
    EXPECT_EQ(fields(value), GetParam().fields);
    value = "-P9Y9M9DT9H9M9S";
    value = text.c_str();
    EXPECT_EQ(fields(value), GetParam().fields);
}
INSTANTIATE_TEST_SUITE_P(
    Texts, DurationParsing,
    testing::Values(Parsed{"everything", "-P1Y2M3DT4H5M6.5S", "-1 2 3 4 5 6.5"},
                    Parsed{"plus", "+P1Y", "1 0 0 0 0 0"}, Parsed{"months", "P1M", "0 1 0 0 0 0"},
                    Parsed{"minutes", "PT1M", "0 0 0 0 1 0"}, Parsed{"seconds", "PT90S", "0 0 0 0 0 90"},
                    Parsed{"a fraction alone", "PT.5S", "0 0 0 0 0 0.5"},
                    Parsed{"behind hours", "PT1H.5S", "0 0 0 1 0 0.5"}, Parsed{"nothing", "", "0 0 0 0 0 0"},
                    Parsed{"a sign before no P", "-1Y", "-0 0 0 0 0 0"},
                    Parsed{"stops at a wrong letter", "P1Y2X3D", "1 0 0 0 0 0"},
                    Parsed{"stops at a missing letter", "P1Y2", "1 0 0 0 0 0"},
                    Parsed{"stops at a missing T", "P1Y5H", "1 0 0 0 0 0"},
                    Parsed{"a number that waits beyond T", "P1T5H", "0 0 0 5 0 0"},
                    Parsed{"a letter that meets the empty rest", "P1TH", "0 0 0 0 0 0"},
                    Parsed{"stored before a rest stops it", "PT5Sx", "0 0 0 0 0 5"},
                    Parsed{"held at 31 bits", "P99999999999Y", "2147483647 0 0 0 0 0"}));

TEST(Duration, ANullTextIsTheEmptyText) {
    const char* const null = nullptr;
    EXPECT_EQ(fields(c_duration(null)), "0 0 0 0 0 0");
    c_duration value("P1Y");
    value = null;
    EXPECT_EQ(fields(value), "0 0 0 0 0 0");
}

TEST(Duration, IsZeroByDefault) { EXPECT_EQ(fields(c_duration()), "0 0 0 0 0 0"); }

TEST(Duration, HasSetters) {
    c_duration value;
    value.set_is_neg(true);
    value.set_years(1);
    value.set_months(2);
    value.set_days(3);
    value.set_hours(4);
    value.set_mins(5);
    value.set_secs(6.5F);
    EXPECT_EQ(fields(value), "-1 2 3 4 5 6.5");
    EXPECT_EQ(value.get_as_string(), "-P1Y2M3DT4H5M6.5S");
}

std::string streamed(const c_duration& value) {
    std::ostringstream os;
    os << value;
    EXPECT_EQ(os.str(), value.get_as_string());
    std::ostringstream exact;
    exact << std::setprecision(7) << value;  // the stream's own way
    std::ostringstream wide;
    wide.precision(6);
    wide << std::showpoint << std::noshowpoint << value;
    EXPECT_EQ(wide.str(), os.str());
    return os.str();
}

class DurationText : public testing::TestWithParam<const char*> {};
TEST_P(DurationText, StandsAsItWasGiven) {
    EXPECT_EQ(streamed(c_duration(GetParam())), GetParam());
    EXPECT_TRUE(c_duration::is_valid(GetParam()));
}
INSTANTIATE_TEST_SUITE_P(Texts, DurationText,
                         testing::Values("P", "-P", "P1Y", "P1M", "P1D", "PT1H", "PT1M", "PT1S", "PT1.5S",
                                         "PT90S", "-P1Y2M3DT4H5M6S", "P1YT1S", "P2147483647Y2147483647M"));

TEST(DurationStreaming, WritesSmallSecondsInFixedNotation) {
    c_duration value;
    value.set_secs(0.0005F);
    EXPECT_EQ(streamed(value), "PT0.000500S");
    value.set_secs(12.3456789F);
    EXPECT_EQ(streamed(value), "PT12.3457S");
    value.set_secs(-5.0F);
    EXPECT_EQ(streamed(value), "PT-5.000000S");
}

TEST(DurationStreaming, FollowsThePrecisionOfTheStream) {
    std::ostringstream os;
    os << std::setprecision(3) << c_duration("PT12.3456S");
    EXPECT_EQ(os.str(), "PT12.3S");
}

TEST(DurationStreaming, LeavesFixedNotationSwitchedOffWhereSecondsWereWritten) {
    std::ostringstream os;
    os << std::fixed << c_duration("P1Y");
    EXPECT_EQ(os.flags() & std::ios::floatfield, std::ios::fixed);
    os << c_duration("PT1.5S");
    EXPECT_EQ(os.flags() & std::ios::floatfield, std::ios::fmtflags());
    EXPECT_EQ(os.str(), "P1YPT1.500000S");
}

/// Numbers grouped by three.
class grouped_numbers : public std::numpunct<char> {
    std::string do_grouping() const override { return "\3"; }
    char do_thousands_sep() const override { return '\''; }
};

TEST(DurationStreaming, GetAsStringFollowsTheLocaleOfTheProcess) {
    const std::locale before = std::locale::global(std::locale(std::locale::classic(), new grouped_numbers));
    const std::string grouped = c_duration("P1000Y").get_as_string();
    std::locale::global(before);
    EXPECT_EQ(grouped, "P1'000Y");
    EXPECT_EQ(c_duration("P1000Y").get_as_string(), "P1000Y");
}

struct Normalised {
    const char* text;
    const char* fields;
};
void PrintTo(const Normalised& c, std::ostream* os) { *os << c.text; }

class DurationNormalize : public testing::TestWithParam<Normalised> {};
TEST_P(DurationNormalize, CarriesWithinDaysAndWithinYears) {
    c_duration value(GetParam().text);
    value.normalize();
    EXPECT_EQ(fields(value), GetParam().fields);
}
INSTANTIATE_TEST_SUITE_P(
    Values, DurationNormalize,
    testing::Values(Normalised{"PT90S", "0 0 0 0 1 30"}, Normalised{"PT60S", "0 0 0 0 1 0"},
                    Normalised{"PT59.5S", "0 0 0 0 0 59.5"}, Normalised{"PT3661S", "0 0 0 1 1 1"},
                    Normalised{"PT25H", "0 0 1 1 0 0"}, Normalised{"PT1440M", "0 0 1 0 0 0"},
                    Normalised{"P25M", "2 1 0 0 0 0"}, Normalised{"P400D", "0 0 400 0 0 0"},
                    Normalised{"-P12M", "-1 0 0 0 0 0"}, Normalised{"P1Y11M30DT23H59M60S", "1 11 31 0 0 0"}));

TEST(Duration, NormalizeLeavesSecondsThatAreNoNumber) {
    for (const float secs :
         {std::numeric_limits<float>::infinity(), -std::numeric_limits<float>::infinity(), 1e30F}) {
        c_duration value("PT61M");
        value.set_secs(secs);
        value.normalize();
        EXPECT_EQ(value.get_secs(), secs);
        EXPECT_EQ(value.get_hours(), 1U);
        EXPECT_EQ(value.get_mins(), 1U);
    }
}

TEST(Duration, NormalizeBorrowsForNegativeSecondsModulo32Bits) {
    c_duration value("PT10M");
    value.set_secs(-90.0F);
    value.normalize();
    EXPECT_EQ(value.get_mins(), 9U);
    EXPECT_EQ(value.get_secs(), -30.0F);
}

/// How two durations stand: "=" same, ">" longer, "<" shorter, "?" depends on the months that are meant.
struct Compared {
    const char* a;
    const char* b;
    char order;
};
void PrintTo(const Compared& c, std::ostream* os) { *os << c.a << ' ' << c.order << ' ' << c.b; }

void expect_order(const c_duration& a, const c_duration& b, char order) {
    EXPECT_EQ(a == b, order == '=');
    EXPECT_EQ(a != b, order != '=');
    EXPECT_EQ(a > b, order == '>');
    EXPECT_EQ(a >= b, order == '>' || order == '=');
    EXPECT_EQ(a < b, order == '<');
    EXPECT_EQ(a <= b, order == '<' || order == '=');
}

class DurationComparison : public testing::TestWithParam<Compared> {};
TEST_P(DurationComparison, AnswersThroughAllOperators) {
    const auto& [a, b, order] = GetParam();
    expect_order(a, b, order);
    const char mirrored = order == '<' ? '>' : order == '>' ? '<' : order;
    expect_order(b, a, mirrored);
}
INSTANTIATE_TEST_SUITE_P(Values, DurationComparison,
                         testing::Values(Compared{"P1Y", "P1Y", '='}, Compared{"P12M", "P1Y", '='},
                                         Compared{"PT90S", "PT1M30S", '='}, Compared{"PT24H", "P1D", '='},
                                         Compared{"P2Y", "P1Y", '>'}, Compared{"PT2S", "PT1S", '>'},
                                         Compared{"P1M", "P30D", '?'}, Compared{"P1M", "P29D", '?'},
                                         Compared{"P1M", "P28D", '>'}, Compared{"P1M", "P27D", '>'},
                                         Compared{"P1M", "P31D", '>'},
                                         // Hours count once they are days.
                                         Compared{"P1M", "P30DT23H", '?'}, Compared{"P1M", "P30DT24H", '>'},
                                         Compared{"P1M", "P27DT23H", '>'}, Compared{"P13M", "P1M", '>'},
                                         // The month fields agree, so the fields decide.
                                         Compared{"P1Y", "P365D", '>'}, Compared{"P12M", "P365D", '>'},
                                         Compared{"P2M", "P1M", '>'}, Compared{"P1Y1M", "P1Y30D", '?'},
                                         Compared{"P1Y1M", "P1M", '>'},
                                         // Intended: the sign takes no part in the order.
                                         Compared{"-P2Y", "-P1Y", '>'}, Compared{"-P1M", "P30D", '>'},
                                         Compared{"-P1M", "-P30D", '?'}, Compared{"-P2Y", "P1Y", '>'}));

// Intended: with unlike signs and like fields neither is longer, so that each is below the other.
TEST(DurationComparison, OppositesAreEachBelowTheOther) {
    const c_duration a("P1Y");
    const c_duration b("-P1Y");
    EXPECT_TRUE(a < b && b < a);
    EXPECT_TRUE(a <= b && b <= a);
    EXPECT_TRUE(a != b);
    EXPECT_FALSE(a > b || b > a || a >= b || a == b);
}

TEST(DurationComparison, LeavesItsOperandsAlone) {
    const c_duration a("PT90S");
    const c_duration b("PT1M30S");
    EXPECT_TRUE(a == b);
    EXPECT_EQ(a.get_as_string(), "PT90S");
}

TEST(DurationComparison, TakesTheLargestFields) {
    c_duration a;
    a.set_months(UINT_MAX);
    a.set_days(UINT_MAX);
    a.set_years(UINT_MAX);
    expect_order(a, a, '=');
}

}  // namespace
