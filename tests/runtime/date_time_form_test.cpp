#include "runtime/date_time_form.h"

#include <gtest/gtest.h>

#include <string>

#include "runtime/date_time.h"

namespace {

using namespace qbxV2;

struct Form {
    edatetime_kind kind;
    const char* text;
    bool valid;
};
void PrintTo(const Form& c, std::ostream* os) { *os << "kind " << c.kind << ": '" << c.text << "'"; }

bool has_form(edatetime_kind kind, const std::string& text) {
    // From a block of exact size, so that a look behind it does not stay unnoticed.
    const std::vector<char> block(text.begin(), text.end());
    return detail::has_date_time_form(kind, block.data(), block.size());
}

class DateTimeForm : public testing::TestWithParam<Form> {};
TEST_P(DateTimeForm, IsCheckedLetterByLetter) {
    EXPECT_EQ(has_form(GetParam().kind, GetParam().text), GetParam().valid);
}

INSTANTIATE_TEST_SUITE_P(
    Date, DateTimeForm,
    testing::Values(Form{EDT_DATE, "2024-01-15", true}, Form{EDT_DATE, "-2024-01-15", true},
                    Form{EDT_DATE, "+2024-01-15", true}, Form{EDT_DATE, "12024-01-15", true},
                    Form{EDT_DATE, "2024-99-99", true}, Form{EDT_DATE, "24-01-15", false},
                    Form{EDT_DATE, "024-01-15", false}, Form{EDT_DATE, "2024-1-15", false},
                    Form{EDT_DATE, "2024-001-15", false}, Form{EDT_DATE, "2024-01-5", false},
                    Form{EDT_DATE, "2024-01-155", false}, Form{EDT_DATE, "2024/01/15", false},
                    Form{EDT_DATE, "2024-01", false}, Form{EDT_DATE, "", false},
                    Form{EDT_DATE, "--2024-01-15", false}, Form{EDT_DATE, " 2024-01-15", false},
                    Form{EDT_DATE, "2024-01-15T10:20:30", false}));

INSTANTIATE_TEST_SUITE_P(
    DateTime, DateTimeForm,
    testing::Values(
        Form{EDT_DATETIME, "2024-01-15T10:20:30", true}, Form{EDT_DATETIME, "2024-13-45T25:61:61Z", true},
        Form{EDT_DATETIME, "0001-00-00T00:00:00", true}, Form{EDT_DATETIME, "2024-01-15T10:20:30.", true},
        Form{EDT_DATETIME, "2024-01-15T10:20:30.5Z", true},
        Form{EDT_DATETIME, "-12024-01-15T10:20:30.123456789-05:30", true},
        Form{EDT_DATETIME, "+2024-01-15T10:20:30", true}, Form{EDT_DATETIME, "2024-01-15", false},
        Form{EDT_DATETIME, "2024-01-15t10:20:30", false}, Form{EDT_DATETIME, "2024-01-15 10:20:30", false},
        Form{EDT_DATETIME, "2024-01-15T10:20", false}, Form{EDT_DATETIME, "2024-01-15T10:20:3", false},
        Form{EDT_DATETIME, "2024-01-15T10:20:300", false}, Form{EDT_DATETIME, "2024-01-15T1:20:30", false},
        Form{EDT_DATETIME, "2024-01-15T-10:20:30", false},
        Form{EDT_DATETIME, "2024-01-15T10:20:30.5.5", false},
        Form{EDT_DATETIME, "2024-01-15T10:20:30,5", false}));

INSTANTIATE_TEST_SUITE_P(Time, DateTimeForm,
                         testing::Values(Form{EDT_TIME, "10:20:30", true},
                                         Form{EDT_TIME, "10:20:30.25", true},
                                         Form{EDT_TIME, "10:20:30.", true}, Form{EDT_TIME, "99:99:99Z", true},
                                         // Intended: a sign passes.
                                         Form{EDT_TIME, "+10:20:30", true}, Form{EDT_TIME, "-10:20:30", true},
                                         Form{EDT_TIME, "10:20", false}, Form{EDT_TIME, "1:20:30", false},
                                         Form{EDT_TIME, "T10:20:30", false}, Form{EDT_TIME, "", false}));

INSTANTIATE_TEST_SUITE_P(
    Parts, DateTimeForm,
    testing::Values(
        Form{EDT_GDAY, "---15", true}, Form{EDT_GDAY, "---99+01:00", true}, Form{EDT_GDAY, "--15", false},
        Form{EDT_GDAY, "---5", false}, Form{EDT_GDAY, "---155", false}, Form{EDT_GDAY, "15", false},
        Form{EDT_GMONTH, "--05--", true}, Form{EDT_GMONTH, "--05--Z", true}, Form{EDT_GMONTH, "--05", false},
        Form{EDT_GMONTH, "--05-", false}, Form{EDT_GMONTH, "--5--", false}, Form{EDT_GMONTH, "-05--", false},
        Form{EDT_GMONTHDAY, "--05-15", true}, Form{EDT_GMONTHDAY, "--05-15-01:00", true},
        Form{EDT_GMONTHDAY, "--05-5", false}, Form{EDT_GMONTHDAY, "--0515", false},
        Form{EDT_GMONTHDAY, "05-15", false}, Form{EDT_GYEAR, "2024", true}, Form{EDT_GYEAR, "-2024Z", true},
        Form{EDT_GYEAR, "+20240", true}, Form{EDT_GYEAR, "202", false}, Form{EDT_GYEAR, "2024-01", false},
        Form{EDT_GYEARMONTH, "2024-01", true}, Form{EDT_GYEARMONTH, "-2024-01+05:30", true},
        Form{EDT_GYEARMONTH, "2024", false}, Form{EDT_GYEARMONTH, "2024-1", false},
        Form{EDT_GYEARMONTH, "2024-01-15", false}));

TEST(DateTimeForm, TakesTheSameZonesBehindEveryKind) {
    const std::pair<edatetime_kind, const char*> bodies[] = {
        {EDT_DATE, "2024-01-15"}, {EDT_DATETIME, "2024-01-15T10:20:30"},
        {EDT_TIME, "10:20:30"},   {EDT_GDAY, "---15"},
        {EDT_GMONTH, "--05--"},   {EDT_GMONTHDAY, "--05-15"},
        {EDT_GYEAR, "2024"},      {EDT_GYEARMONTH, "2024-01"}};
    for (const auto& [kind, body] : bodies) {
        for (const char* zone : {"", "Z", "+00:00", "-05:30", "+99:99"}) {
            EXPECT_TRUE(has_form(kind, std::string(body) + zone)) << body << zone;
        }
        for (const char* zone : {"z", "ZZ", "Z ", " Z", "+", "+5", "+05", "+05:", "+05:3", "+05:300", "+5:30",
                                 "+0530", "05:30", "+05:30Z", "Z+05:30", "*05:30", "+a5:30"}) {
            EXPECT_FALSE(has_form(kind, std::string(body) + zone)) << body << zone;
        }
    }
}

TEST(DateTimeForm, RefusesEveryBeginningOfADateTime) {
    const std::string text = "2024-01-15T10:20:30";
    for (std::size_t size = 0; size < text.size(); ++size) {
        EXPECT_FALSE(has_form(EDT_DATETIME, text.substr(0, size))) << size;
    }
}

TEST(DateTimeForm, IsWhatTheClassesAskFor) {
    EXPECT_TRUE(c_date::is_valid("2024-01-15"));
    EXPECT_TRUE(c_datetime::is_valid("2024-01-15T10:20:30"));
    EXPECT_TRUE(c_time::is_valid("10:20:30"));
    EXPECT_TRUE(c_gday::is_valid("---15"));
    EXPECT_TRUE(c_gmonth::is_valid("--05--"));
    EXPECT_TRUE(c_gmonthday::is_valid("--05-15"));
    EXPECT_TRUE(c_gyear::is_valid("2024"));
    EXPECT_TRUE(c_gyearmonth::is_valid("2024-01"));
    EXPECT_FALSE(c_date::is_valid("2024"));
    EXPECT_FALSE(c_datetime::is_valid("2024-01-15"));
    EXPECT_FALSE(c_time::is_valid("2024"));
    EXPECT_FALSE(c_gday::is_valid("--05--"));
    EXPECT_FALSE(c_gmonth::is_valid("---15"));
    EXPECT_FALSE(c_gmonthday::is_valid("--05--"));
    EXPECT_FALSE(c_gyear::is_valid("2024-01"));
    EXPECT_FALSE(c_gyearmonth::is_valid("2024"));
    EXPECT_TRUE(c_gyear::is_valid("2024-01", 4));
}

}  // namespace
