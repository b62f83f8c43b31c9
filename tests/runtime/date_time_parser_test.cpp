#include "runtime/date_time_parser.h"

#include <gtest/gtest.h>

#include <cmath>
#include <sstream>
#include <string>
#include <vector>

#include "runtime/date_time.h"

namespace {

using namespace qbxV2;

s_datetime_record parsed(edatetime_kind kind, const std::string& text, s_datetime_record record = {}) {
    const std::vector<char> block(text.begin(), text.end());
    detail::parse_date_time(kind, block.data(), block.size(), record);
    return record;
}

/// All fields, so that one text tells what was stored and what was left alone.
std::string fields(const s_datetime_record& r) {
    std::ostringstream os;
    os << r.year << ' ' << r.month << ' ' << r.day << ' ' << r.hours << ' ' << r.mins << ' ' << r.secs << ' '
       << r.total_offset_mins << (r.is_utc ? " utc" : "");
    return os.str();
}

/// Values that no text below has.
const s_datetime_record k_old = {-7, 77, 78, 79, 80, 81.5F, 82, true};

struct Stored {
    const char* why;
    edatetime_kind kind;
    const char* text;
    const char* fields;
};
void PrintTo(const Stored& c, std::ostream* os) {
    *os << c.why << ": kind " << c.kind << " '" << c.text << "'";
}

class DateTimeParser : public testing::TestWithParam<Stored> {};
TEST_P(DateTimeParser, StoresWhatItMeets) {
    EXPECT_EQ(fields(parsed(GetParam().kind, GetParam().text, k_old)), GetParam().fields);
}

INSTANTIATE_TEST_SUITE_P(
    WholeTexts, DateTimeParser,
    testing::Values(
        Stored{"no zone clears both", EDT_DATE, "2024-01-15", "2024 1 15 79 80 81.5 0"},
        Stored{"UTC clears the offset", EDT_DATE, "2024-01-15Z", "2024 1 15 79 80 81.5 0 utc"},
        Stored{"an offset clears UTC", EDT_DATE, "2024-01-15+05:30", "2024 1 15 79 80 81.5 330"},
        Stored{"a negative year", EDT_DATE, "-2024-01-15", "-2024 1 15 79 80 81.5 0"},
        Stored{"a plus", EDT_DATE, "+2024-01-15", "2024 1 15 79 80 81.5 0"},
        Stored{"date and time", EDT_DATETIME, "2024-01-15T10:20:30", "2024 1 15 10 20 30 0"},
        Stored{"fraction and UTC", EDT_DATETIME, "2024-01-15T10:20:30.5Z", "2024 1 15 10 20 30.5 0 utc"},
        Stored{"a point alone", EDT_DATETIME, "2024-01-15T10:20:30.", "2024 1 15 10 20 30 0"},
        Stored{"east", EDT_DATETIME, "2024-01-15T10:20:30+05:30", "2024 1 15 10 20 30 330"},
        Stored{"west", EDT_DATETIME, "2024-01-15T10:20:30-05:30", "2024 1 15 10 20 30 -330"},
        Stored{"out of any range", EDT_DATETIME, "2024-13-45T25:61:61+99:99", "2024 13 45 25 61 61 6039"},
        Stored{"a negative year", EDT_DATETIME, "-0005-01-02T03:04:05Z", "-5 1 2 3 4 5 0 utc"},
        Stored{"time", EDT_TIME, "10:20:30.25-01:00", "-7 77 78 10 20 30.25 -60"},
        Stored{"day", EDT_GDAY, "---15Z", "-7 77 15 79 80 81.5 0 utc"},
        Stored{"month", EDT_GMONTH, "--05--", "-7 5 78 79 80 81.5 0"},
        Stored{"month and day", EDT_GMONTHDAY, "--05-15", "-7 5 15 79 80 81.5 0"},
        Stored{"year", EDT_GYEAR, "-12024Z", "-12024 77 78 79 80 81.5 0 utc"},
        Stored{"year and month", EDT_GYEARMONTH, "-2024-05", "-2024 5 78 79 80 81.5 0"}));

INSTANTIATE_TEST_SUITE_P(
    Stops, DateTimeParser,
    testing::Values(
        Stored{"a year without digits is stored", EDT_DATE, "", "0 77 78 79 80 81.5 82 utc"},
        Stored{"a short year is stored without sign", EDT_DATE, "-24-01-15", "24 77 78 79 80 81.5 82 utc"},
        Stored{"a year alone keeps no sign", EDT_DATE, "-2024", "2024 77 78 79 80 81.5 82 utc"},
        Stored{"a short month is stored", EDT_DATE, "-2024-1-15", "2024 1 78 79 80 81.5 82 utc"},
        Stored{"a long month is stored", EDT_DATE, "-2024-123-15", "2024 123 78 79 80 81.5 82 utc"},
        Stored{"a short day is stored", EDT_DATE, "-2024-01-5", "2024 1 5 79 80 81.5 82 utc"},
        Stored{"a bad zone keeps zone and sign away", EDT_DATE, "-2024-01-15x",
               "2024 1 15 79 80 81.5 82 utc"},
        Stored{"a short offset", EDT_DATE, "-2024-01-15+5:30", "2024 1 15 79 80 81.5 82 utc"},
        Stored{"a zone with a rest", EDT_DATE, "2024-01-15+05:30x", "2024 1 15 79 80 81.5 82 utc"},
        Stored{"Z with a rest", EDT_DATE, "2024-01-15Zx", "2024 1 15 79 80 81.5 82 utc"},
        // The sign of a date-time's year is applied in front of the zone.
        Stored{"a bad zone of a date-time", EDT_DATETIME, "-2024-01-15T10:20:30x",
               "-2024 1 15 10 20 30 82 utc"},
        Stored{"no time", EDT_DATETIME, "-2024-01-15", "2024 1 15 79 80 81.5 82 utc"},
        Stored{"hours without digits", EDT_DATETIME, "2024-01-15T", "2024 1 15 0 80 81.5 82 utc"},
        Stored{"three digits of hours", EDT_DATETIME, "2024-01-15T100:20:30", "2024 1 15 100 80 81.5 82 utc"},
        Stored{"one digit of mins", EDT_DATETIME, "2024-01-15T10:2:30", "2024 1 15 10 2 81.5 82 utc"},
        Stored{"one character of seconds", EDT_DATETIME, "-2024-01-15T10:20:5", "2024 1 15 10 20 5 82 utc"},
        Stored{"a digit and a point suffice", EDT_DATETIME, "2024-01-15T10:20:5.", "2024 1 15 10 20 5 0"},
        Stored{"a point and a digit suffice", EDT_DATETIME, "2024-01-15T10:20:.5", "2024 1 15 10 20 0.5 0"},
        Stored{"three digits of seconds", EDT_DATETIME, "2024-01-15T10:20:300Z", "2024 1 15 10 20 300 0 utc"},
        Stored{"two dashes before a day", EDT_GDAY, "--15", "-7 77 78 79 80 81.5 82 utc"},
        Stored{"one digit of a lone day", EDT_GDAY, "---5", "-7 77 5 79 80 81.5 0"},
        Stored{"three digits of a lone day", EDT_GDAY, "---155Z", "-7 77 155 79 80 81.5 0 utc"},
        Stored{"no digit of a lone day", EDT_GDAY, "---Z", "-7 77 0 79 80 81.5 82 utc"},
        Stored{"a month without dashes behind", EDT_GMONTH, "--05", "-7 5 78 79 80 81.5 82 utc"},
        Stored{"a short lone month", EDT_GMONTH, "--5--", "-7 5 78 79 80 81.5 82 utc"},
        Stored{"one digit of the day behind a month", EDT_GMONTHDAY, "--05-5Z", "-7 5 5 79 80 81.5 0 utc"},
        Stored{"a bad zone of a year", EDT_GYEAR, "-2024x", "2024 77 78 79 80 81.5 82 utc"},
        Stored{"a bad zone of a year and month", EDT_GYEARMONTH, "-2024-05x",
               "2024 5 78 79 80 81.5 82 utc"}));

// Intended: the form takes a sign, the parser does not.
TEST(DateTimeParser, ASignedTimeParsesToNothing) {
    EXPECT_TRUE(c_time::is_valid("+10:20:30"));
    const c_time value("+10:20:30");
    EXPECT_EQ(value.get_hours(), 0U);
    EXPECT_EQ(value.get_mins(), 0U);
    EXPECT_EQ(value.get_secs(), 0.0F);
}

TEST(DateTimeParser, CountsYearsModulo32Bits) {
    EXPECT_EQ(parsed(EDT_GYEAR, "2147483648").year, -2147483647 - 1);
    EXPECT_EQ(parsed(EDT_GYEAR, "-2147483648").year, -2147483647 - 1);
    EXPECT_EQ(parsed(EDT_GYEAR, "4294967297").year, 1);
    EXPECT_EQ(parsed(EDT_GYEAR, std::string(100000, '9')).year, parsed(EDT_GYEAR, std::string(32, '9')).year);
}

TEST(DateTimeParser, SumsSecondsInSinglePrecision) {
    EXPECT_EQ(parsed(EDT_TIME, "10:20:05.25").secs, 5.25F);
    EXPECT_NEAR(parsed(EDT_TIME, "10:20:12.3456789").secs, 12.3456789F, 1e-6F);
    EXPECT_NEAR(parsed(EDT_TIME, "10:20:59.999").secs, 59.999F, 1e-5F);
    EXPECT_EQ(parsed(EDT_TIME, "10:20:30." + std::string(100000, '0') + "9").secs, 30.0F);
    EXPECT_TRUE(std::isinf(parsed(EDT_TIME, "10:20:" + std::string(100, '9')).secs));
}

TEST(DateTimeParser, TakesEveryBeginningOfAText) {
    const std::string text = "-2024-01-15T10:20:30.5+05:30";
    for (std::size_t size = 0; size <= text.size(); ++size) {
        for (int kind = EDT_DATE; kind <= EDT_GYEARMONTH; ++kind) {
            const s_datetime_record record = parsed(static_cast<edatetime_kind>(kind), text.substr(0, size));
            const bool is_whole = kind == EDT_DATETIME && size == text.size();
            EXPECT_EQ(record.total_offset_mins, is_whole ? 330 : 0) << kind << " " << size;
        }
    }
}

}  // namespace
