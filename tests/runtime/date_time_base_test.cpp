#include "runtime/date_time_base.h"

#include <gtest/gtest.h>

#include <climits>
#include <locale>
#include <sstream>

#include "runtime/date_time.h"

namespace {

using qbxV2::c_datetime;
using qbxV2::c_datetime_base;

TEST(DateTimeBase, StandsByItself) {
    const c_datetime_base value;
    EXPECT_EQ(value.get_total_offset_mins(), 0);
    EXPECT_FALSE(value.get_is_utc());
}

struct Offset {
    int hours;
    unsigned int mins;
    int total;
};
void PrintTo(const Offset& c, std::ostream* os) { *os << c.hours << " and " << c.mins; }

class SetOffset : public testing::TestWithParam<Offset> {};
TEST_P(SetOffset, AddsMinutesAwayFromZero) {
    for (const bool is_utc : {false, true}) {
        c_datetime_base value;
        value.set_is_utc(is_utc);
        value.set_offset(GetParam().hours, GetParam().mins);
        EXPECT_EQ(value.get_total_offset_mins(), GetParam().total);
        // A total of zero leaves it as it was; any other clears it.
        EXPECT_EQ(value.get_is_utc(), GetParam().total == 0 && is_utc);
    }
}
INSTANTIATE_TEST_SUITE_P(Offsets, SetOffset,
                         testing::Values(Offset{-1, 30, -90}, Offset{1, 30, 90}, Offset{0, 0, 0},
                                         Offset{0, 30, 30}, Offset{-5, 0, -300}, Offset{14, 0, 840},
                                         Offset{-1, UINT_MAX, -59}, Offset{INT_MAX, 0, -60}));

TEST(DateTimeBase, SettersTouchOneFieldEach) {
    c_datetime_base value;
    value.set_is_utc(true);
    value.set_total_offset_mins(60);
    EXPECT_TRUE(value.get_is_utc());
    value.set_is_utc(false);
    EXPECT_EQ(value.get_total_offset_mins(), 60);
}

/// Numbers grouped by three, with a decimal comma.
class grouped_numbers : public std::numpunct<char> {
    char do_decimal_point() const override { return ','; }
    std::string do_grouping() const override { return "\3"; }
    char do_thousands_sep() const override { return '.'; }
};

class process_locale {
public:
    explicit process_locale(const std::locale& locale) : m_before(std::locale::global(locale)) {}
    ~process_locale() { std::locale::global(m_before); }

private:
    std::locale m_before;
};

TEST(DateTimeBase, GetAsStringFollowsTheLocaleOfTheProcess) {
    const c_datetime value("2024-01-15T10:20:30.5Z");
    const process_locale changed(std::locale(std::locale::classic(), new grouped_numbers));
    EXPECT_EQ(value.get_as_string(), "2.024-01-15T10:20:30,5Z");
    std::string text;
    value.append_text(text);
    EXPECT_EQ(text, "2024-01-15T10:20:30.5Z");
}

}  // namespace
