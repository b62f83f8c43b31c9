#include "runtime/date_time.h"

#include <gtest/gtest.h>

#include <sstream>

namespace {

using namespace qbxV2;

template <typename Value>
void expect_round_trip(const std::string& text) {
    ASSERT_TRUE(Value::is_valid(text)) << text;
    const Value from_string(text);
    EXPECT_EQ(from_string.get_as_string(), text);
    const Value from_pointer(text.c_str());
    EXPECT_EQ(from_pointer.get_as_string(), text);
    Value assigned;
    assigned = text;
    EXPECT_EQ(assigned.get_as_string(), text);
    Value assigned_pointer;
    Value& result = assigned_pointer = text.c_str();
    EXPECT_EQ(&result, &assigned_pointer);
    Value copy(assigned_pointer);
    copy = assigned;
    std::ostringstream os;
    os << copy;
    EXPECT_EQ(os.str(), text);
    std::string appended = "kept ";
    copy.append_text(appended);
    EXPECT_EQ(appended, "kept " + text);
}

TEST(DateTimeClasses, PrintWhatTheyParsed) {
    for (const std::string zone : {"", "Z", "+05:30", "-05:30"}) {
        expect_round_trip<c_date>("2024-01-15" + zone);
        expect_round_trip<c_date>("-2024-01-15" + zone);
        expect_round_trip<c_datetime>("2024-01-15T10:20:30" + zone);
        expect_round_trip<c_datetime>("2024-01-15T10:20:30.5" + zone);
        expect_round_trip<c_datetime>("12024-13-45T25:61:61" + zone);
        expect_round_trip<c_time>("10:20:30.25" + zone);
        expect_round_trip<c_gday>("---15" + zone);
        expect_round_trip<c_gmonth>("--05--" + zone);
        expect_round_trip<c_gmonthday>("--05-15" + zone);
        expect_round_trip<c_gyear>("2024" + zone);
        expect_round_trip<c_gyearmonth>("2024-05" + zone);
    }
}

TEST(DateTimeClasses, HaveTheFieldsOfTheirType) {
    c_datetime value;
    value.set_year(2024);
    value.set_month(1);
    value.set_day(15);
    value.set_hours(10);
    value.set_mins(20);
    value.set_secs(30.5F);
    value.set_is_utc(true);
    EXPECT_EQ(value.get_as_string(), "2024-01-15T10:20:30.5Z");
    EXPECT_EQ(value.get_year(), 2024);
    EXPECT_EQ(value.get_month(), 1U);
    EXPECT_EQ(value.get_day(), 15U);
    EXPECT_EQ(value.get_hours(), 10U);
    EXPECT_EQ(value.get_mins(), 20U);
    EXPECT_EQ(value.get_secs(), 30.5F);

    c_date date;
    date.set_year(2024);
    date.set_month(2);
    date.set_day(3);
    EXPECT_EQ(date.get_as_string(), "2024-02-03");
    EXPECT_EQ(date.get_year() + static_cast<int>(date.get_month() + date.get_day()), 2029);

    c_time time;
    time.set_hours(1);
    time.set_mins(2);
    time.set_secs(3);
    EXPECT_EQ(time.get_as_string(), "01:02:03");
    EXPECT_EQ(time.get_hours() + time.get_mins(), 3U);
    EXPECT_EQ(time.get_secs(), 3.0F);

    c_gday day;
    day.set_day(7);
    EXPECT_EQ(day.get_as_string(), "---07");
    EXPECT_EQ(day.get_day(), 7U);

    c_gmonth month;
    month.set_month(7);
    EXPECT_EQ(month.get_as_string(), "--07--");
    EXPECT_EQ(month.get_month(), 7U);

    c_gmonthday month_day;
    month_day.set_month(7);
    month_day.set_day(8);
    EXPECT_EQ(month_day.get_as_string(), "--07-08");
    EXPECT_EQ(month_day.get_month() + month_day.get_day(), 15U);

    c_gyear year;
    year.set_year(-5);
    EXPECT_EQ(year.get_as_string(), "00-5");
    EXPECT_EQ(year.get_year(), -5);

    c_gyearmonth year_month;
    year_month.set_year(2024);
    year_month.set_month(7);
    EXPECT_EQ(year_month.get_as_string(), "2024-07");
    EXPECT_EQ(year_month.get_year(), 2024);
    EXPECT_EQ(year_month.get_month(), 7U);
}

TEST(DateTimeClasses, DefaultIsValidByItsOwnCheck) {
    EXPECT_EQ(c_datetime().get_as_string(), "0001-00-00T00:00:00");
    EXPECT_TRUE(c_datetime::is_valid(c_datetime().get_as_string()));
    EXPECT_EQ(c_date().get_as_string(), "0001-00-00");
}

TEST(DateTimeClasses, AnAssignmentFromABadTextKeepsOlderFields) {
    c_datetime value("2024-01-15T10:20:30+05:30");
    value = "2025-xx";
    EXPECT_EQ(value.get_as_string(), "2025-00-15T10:20:30+05:30");
}

TEST(DateTimeClasses, ANullTextIsTheEmptyText) {
    const char* const null = nullptr;
    EXPECT_EQ(c_gday(null).get_as_string(), "---00");
    c_gday value("---15Z");
    value = null;
    EXPECT_EQ(value.get_as_string(), "---15Z");
}

TEST(DateTimeClasses, ParseABlockWithoutTerminator) {
    const char block[] = {'2', '0', '2', '4', '-', '0', '5', '9'};
    c_gyearmonth value;
    EXPECT_EQ(&value.parse(block, 7), &value);
    EXPECT_EQ(value.get_as_string(), "2024-05");
    EXPECT_TRUE(c_gyearmonth::is_valid(block, 7));
    EXPECT_FALSE(c_gyearmonth::is_valid(block, 8));
}

TEST(DateTimeClasses, TheModelsNameIsTheSameClass) {
    const tc_datetime value("2024-01-15T10:20:30Z");
    const c_datetime& same = value;
    EXPECT_EQ(same.get_as_string(), "2024-01-15T10:20:30Z");
}

void expect_order(const c_date& a, const c_date& b, int order) {
    EXPECT_EQ(a == b, order == 0);
    EXPECT_EQ(a != b, order != 0);
    EXPECT_EQ(a < b, order < 0);
    EXPECT_EQ(a <= b, order <= 0);
    EXPECT_EQ(a > b, order > 0);
    EXPECT_EQ(a >= b, order >= 0);
}

TEST(DateComparison, IsByYearMonthDay) {
    expect_order("2024-01-15", "2024-01-15", 0);
    expect_order("2023-12-31", "2024-01-01", -1);
    expect_order("2024-02-01", "2024-01-31", 1);
    expect_order("2024-01-14", "2024-01-15", -1);
    expect_order("-2024-01-15", "2024-01-15", -1);
    expect_order("-2025-01-15", "-2024-01-15", -1);
}

TEST(DateComparison, ServesOtherClassesWhenConverted) {
    const auto date = [](const char* text) { return c_date(c_datetime(text)); };
    expect_order(date("2024-01-15T10:20:30"), date("2024-01-15T10:20:30"), 0);
    expect_order(date("2024-01-15T09:20:30"), date("2024-01-15T10:00:00"), -1);
    expect_order(date("2024-01-15T10:21:00"), date("2024-01-15T10:20:30"), 1);
    expect_order(date("2024-01-15T10:20:30.25"), date("2024-01-15T10:20:30.5"), -1);
    expect_order(c_date(c_time("10:20:30")), c_date(c_time("10:20:31")), -1);
    expect_order(c_date(c_gyear("2024")), c_date(c_gyear("2023")), 1);
}

// Intended: the zone takes no part.
TEST(DateComparison, NoonIsNoonInEveryZone) {
    expect_order(c_date(c_datetime("2024-01-15T12:00:00Z")), c_date(c_datetime("2024-01-15T12:00:00+05:00")),
                 0);
    expect_order("2024-01-15Z", "2024-01-15-11:00", 0);
}

}  // namespace
