#include "runtime/date_time_printer.h"

#include <gtest/gtest.h>

#include <climits>
#include <cmath>
#include <cstring>
#include <iomanip>
#include <limits>
#include <random>
#include <sstream>
#include <string>

#include "runtime/date_time.h"

namespace {

using namespace qbxV2;

std::string formatted(edatetime_kind kind, const s_datetime_record& record) {
    char text[detail::k_date_time_text_size];
    return std::string(text, detail::format_date_time(kind, record, text));
}

std::string streamed(edatetime_kind kind, const s_datetime_record& record) {
    std::ostringstream os;
    detail::stream_date_time(kind, record, os);
    return os.str();
}

struct Printed {
    const char* why;
    edatetime_kind kind;
    s_datetime_record record;
    const char* text;
};
void PrintTo(const Printed& c, std::ostream* os) { *os << c.why << ": " << c.text; }

class DateTimePrinter : public testing::TestWithParam<Printed> {};
TEST_P(DateTimePrinter, WritesTheFormOfTheKind) {
    EXPECT_EQ(formatted(GetParam().kind, GetParam().record), GetParam().text);
    EXPECT_EQ(streamed(GetParam().kind, GetParam().record), GetParam().text);
}

constexpr s_datetime_record k_record = {2024, 1, 5, 7, 8, 9.5F, 0, false};
constexpr s_datetime_record with_year(int year) { return {year, 1, 5, 7, 8, 9.5F, 0, false}; }
constexpr s_datetime_record with_zone(int mins, bool is_utc) {
    return {2024, 1, 5, 7, 8, 9.5F, mins, is_utc};
}
constexpr s_datetime_record with_secs(float secs) { return {2024, 1, 5, 7, 8, secs, 0, false}; }

INSTANTIATE_TEST_SUITE_P(Kinds, DateTimePrinter,
                         testing::Values(Printed{"date", EDT_DATE, k_record, "2024-01-05"},
                                         Printed{"date and time", EDT_DATETIME, k_record,
                                                 "2024-01-05T07:08:09.5"},
                                         Printed{"time", EDT_TIME, k_record, "07:08:09.5"},
                                         Printed{"day", EDT_GDAY, k_record, "---05"},
                                         Printed{"month", EDT_GMONTH, k_record, "--01--"},
                                         Printed{"month and day", EDT_GMONTHDAY, k_record, "--01-05"},
                                         Printed{"year", EDT_GYEAR, k_record, "2024"},
                                         Printed{"year and month", EDT_GYEARMONTH, k_record, "2024-01"},
                                         Printed{"the defaults", EDT_DATETIME, {}, "0001-00-00T00:00:00"}));

INSTANTIATE_TEST_SUITE_P(Years, DateTimePrinter,
                         testing::Values(Printed{"zeros before the sign", EDT_GYEAR, with_year(-5), "00-5"},
                                         Printed{"no room for zeros", EDT_GYEAR, with_year(-2000), "-2000"},
                                         Printed{"wider than four", EDT_GYEAR, with_year(12024), "12024"},
                                         Printed{"zero", EDT_GYEAR, with_year(0), "0000"},
                                         Printed{"the least", EDT_GYEAR, with_year(INT_MIN), "-2147483648"}));

INSTANTIATE_TEST_SUITE_P(
    Zones, DateTimePrinter,
    testing::Values(Printed{"UTC", EDT_GYEAR, with_zone(0, true), "2024Z"},
                    Printed{"UTC wins over an offset", EDT_GYEAR, with_zone(60, true), "2024Z"},
                    Printed{"east", EDT_GYEAR, with_zone(330, false), "2024+05:30"},
                    Printed{"west", EDT_GYEAR, with_zone(-330, false), "2024-05:30"},
                    Printed{"less than an hour west", EDT_GYEAR, with_zone(-5, false), "2024-00:05"},
                    Printed{"hours beyond two digits", EDT_GYEAR, with_zone(6100, false), "2024+101:40"},
                    Printed{"the least", EDT_GYEAR, with_zone(INT_MIN, false), "2024-35791394:08"},
                    Printed{"behind a date", EDT_DATE, with_zone(0, true), "2024-01-05Z"},
                    Printed{"behind a date and time", EDT_DATETIME, with_zone(0, true),
                            "2024-01-05T07:08:09.5Z"},
                    Printed{"behind a time", EDT_TIME, with_zone(0, true), "07:08:09.5Z"},
                    Printed{"behind a day", EDT_GDAY, with_zone(0, true), "---05Z"},
                    Printed{"behind a month", EDT_GMONTH, with_zone(0, true), "--01--Z"},
                    Printed{"behind month and day", EDT_GMONTHDAY, with_zone(0, true), "--01-05Z"},
                    Printed{"behind year and month", EDT_GYEARMONTH, with_zone(0, true), "2024-01Z"}));

INSTANTIATE_TEST_SUITE_P(
    Seconds, DateTimePrinter,
    testing::Values(Printed{"below ten", EDT_TIME, with_secs(5.25F), "07:08:05.25"},
                    Printed{"zero", EDT_TIME, with_secs(0.0F), "07:08:00"},
                    Printed{"two digits", EDT_TIME, with_secs(59.5F), "07:08:59.5"},
                    Printed{"six significant digits", EDT_TIME, with_secs(12.3456789F), "07:08:12.3457"},
                    Printed{"fixed below a thousandth", EDT_TIME, with_secs(0.0005F), "07:08:00.000500"},
                    Printed{"a thousandth", EDT_TIME, with_secs(0.0010001F), "07:08:00.0010001"},
                    Printed{"ten", EDT_TIME, with_secs(10.0F), "07:08:10"},
                    Printed{"a hundred", EDT_TIME, with_secs(100.0F), "07:08:100"},
                    Printed{"a million", EDT_TIME, with_secs(1e6F), "07:08:1e+06"},
                    Printed{"below zero is below ten and fixed", EDT_TIME, with_secs(-5.0F),
                            "07:08:0-5.000000"},
                    Printed{"minus zero", EDT_TIME, with_secs(-0.0F), "07:08:0-0"}));

TEST(DateTimePrinter, BufferAndStreamAgreeOnRandomValues) {
    std::mt19937 random(15);
    for (int round = 0; round < 20000; ++round) {
        s_datetime_record r;
        r.year = static_cast<int>(random()) >> (random() % 32);
        r.month = static_cast<unsigned int>(random()) >> (random() % 32);
        r.day = static_cast<unsigned int>(random()) >> (random() % 32);
        r.hours = static_cast<unsigned int>(random()) >> (random() % 32);
        r.mins = static_cast<unsigned int>(random()) >> (random() % 32);
        r.total_offset_mins = static_cast<int>(random()) >> (random() % 32);
        r.is_utc = random() % 4 == 0;
        const auto bits = static_cast<std::uint32_t>(random());
        if (random() % 2 == 0) {
            std::memcpy(&r.secs, &bits, sizeof r.secs);
        } else {
            r.secs = static_cast<float>(bits % 60000) / 1000.0F;
        }
        const auto kind = static_cast<edatetime_kind>(random() % 8);
        ASSERT_EQ(formatted(kind, r), streamed(kind, r));
    }
}

TEST(DateTimePrinter, BufferAndStreamAgreeOnSecondsThatAreNoNumber) {
    const float infinity = std::numeric_limits<float>::infinity();
    const float nan = std::numeric_limits<float>::quiet_NaN();
    for (const float secs : {infinity, -infinity, nan, -std::numeric_limits<float>::max()}) {
        EXPECT_EQ(formatted(EDT_DATETIME, with_secs(secs)), streamed(EDT_DATETIME, with_secs(secs)));
        EXPECT_LE(
            formatted(EDT_DATETIME, {INT_MIN, UINT_MAX, UINT_MAX, UINT_MAX, UINT_MAX, secs, INT_MIN, false})
                .size(),
            detail::k_date_time_text_size);
    }
}

TEST(DateTimeStreaming, LeavesTheFillAtZero) {
    std::ostringstream os;
    os.fill('*');
    os << c_datetime("2024-01-05T07:08:09Z");
    EXPECT_EQ(os.fill(), '0');
    std::ostringstream shaped;
    shaped << std::setfill('*') << std::left << c_gyear("0005");
    EXPECT_EQ(shaped.fill(), '0');
    EXPECT_EQ(shaped.str(), "5000");
}

TEST(DateTimeStreaming, LeavesFixedNotationSwitchedOffWhereSecondsWereWritten) {
    std::ostringstream os;
    os << std::fixed << c_time("07:08:09.5");
    EXPECT_EQ(os.str(), "07:08:09.500000");
    EXPECT_EQ(os.flags() & std::ios::floatfield, std::ios::fmtflags());
    std::ostringstream date;
    date << std::fixed << c_date("2024-01-05");
    EXPECT_EQ(date.flags() & std::ios::floatfield, std::ios::fixed);
    std::ostringstream small;
    c_time value;
    value.set_secs(0.0005F);
    small << value;
    EXPECT_EQ(small.str(), "00:00:00.000500");
    EXPECT_EQ(small.flags() & std::ios::floatfield, std::ios::fmtflags());
}

TEST(DateTimeStreaming, WritesSecondsAtThePrecisionOfTheStream) {
    const c_time value("07:08:12.3456789");
    std::ostringstream os;
    os << std::setprecision(3) << value << ' ' << std::setprecision(6) << value;
    EXPECT_EQ(os.str(), "07:08:12.3 07:08:12.3457");
    std::ostringstream small;
    c_time thin;
    thin.set_secs(0.0005F);
    small << std::setprecision(4) << thin;
    EXPECT_EQ(small.str(), "00:00:00.0005");
}

}  // namespace
