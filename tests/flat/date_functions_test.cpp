#include <string>

#include "tests/flat/flat_driver.h"
#include "tests/flat/reported_null.h"

/// Dates, times and durations through their C functions.
namespace vrl_flat_driver {
namespace {

/// What the eight date and time classes have in common.
struct date_class {
    const char* name;
    const char* text;  ///< with a zone of +05:30
    void* (*create)();
    void* (*create_from)(const char*);
    void (*destroy)(void*);
    char* (*as_string)(void*);
    int32_t (*is_valid)(const char*);
    int32_t (*get_is_utc)(void*);
    void (*set_is_utc)(void*, int32_t);
    int32_t (*get_offset)(void*);
    void (*set_total)(void*, int32_t);
    void (*set_offset)(void*, int32_t, uint32_t);
    void (*set_offset_mins)(void*, int32_t, uint32_t);
};

#define DATE_CLASS(name, text)                                                                          \
    {                                                                                                   \
#name, text, &CSharp_new_##name##__SWIG_0, &CSharp_new_##name##__SWIG_1, &CSharp_delete_##name, \
            &CSharp_##name##_get_as_string, &CSharp_##name##_is_valid, &CSharp_##name##_get_is_utc,     \
            &CSharp_##name##_set_is_utc, &CSharp_##name##_get_total_offset_mins,                        \
            &CSharp_##name##_set_total_offset_mins, &CSharp_##name##_set_offset,                        \
            &CSharp_##name##_set_offset_mins                                                            \
    }

const date_class k_date_classes[] = {
    DATE_CLASS(c_date, "2024-01-15+05:30"), DATE_CLASS(c_datetime, "2024-01-15T10:20:30.5+05:30"),
    DATE_CLASS(c_time, "10:20:30.5+05:30"), DATE_CLASS(c_gday, "---15+05:30"),
    DATE_CLASS(c_gmonth, "--01--+05:30"),   DATE_CLASS(c_gmonthday, "--01-15+05:30"),
    DATE_CLASS(c_gyear, "2024+05:30"),      DATE_CLASS(c_gyearmonth, "2024-01+05:30"),
};

class FlatDates : public testing::TestWithParam<date_class> {
protected:
    void SetUp() override { listen_for_nulls(); }
};

TEST_P(FlatDates, ReadAndWriteTheirText) {
    const date_class& d = GetParam();
    EXPECT_EQ(d.is_valid(d.text), 1);
    EXPECT_EQ(d.is_valid("soon"), 0);
    void* const value = d.create_from(d.text);
    EXPECT_EQ(taken_text(d.as_string(value)), d.text);
    EXPECT_EQ(d.get_offset(value), 330);
    EXPECT_EQ(d.get_is_utc(value), 0);
    d.destroy(value);
}

TEST_P(FlatDates, KeepZoneAndOffsetApart) {
    const date_class& d = GetParam();
    void* const value = d.create();
    d.set_is_utc(value, 0x100);
    EXPECT_EQ(d.get_is_utc(value), 1);
    d.set_total(value, 60);
    EXPECT_EQ(taken_text(d.as_string(value)).back(), 'Z') << "the zone wins";
    for (const auto set : {d.set_offset, d.set_offset_mins}) {
        d.set_is_utc(value, 1);
        set(value, 0, 0);
        EXPECT_EQ(d.get_is_utc(value), 1);
        set(value, -1, 30);
        EXPECT_EQ(d.get_offset(value), -90);
        EXPECT_EQ(d.get_is_utc(value), 0);
        set(value, 1, 30);
        EXPECT_EQ(d.get_offset(value), 90);
    }
    d.destroy(value);
}

TEST_P(FlatDates, ReportNulls) {
    const date_class& d = GetParam();
    const std::string told = std::string("qbxV2::") + d.name + " & type is null";
    EXPECT_EQ(d.create_from(nullptr), nullptr);
    expect_message("null string");
    EXPECT_EQ(d.is_valid(nullptr), 0);
    expect_message("null string");
    EXPECT_EQ(d.as_string(nullptr), nullptr);
    expect_message(told);
    EXPECT_EQ(d.get_is_utc(nullptr), 0);
    expect_message(told);
    EXPECT_EQ(d.get_offset(nullptr), 0);
    expect_message(told);
    d.set_is_utc(nullptr, 1);
    expect_message(told);
    d.set_total(nullptr, 1);
    expect_message(told);
    d.set_offset(nullptr, 1, 1);
    expect_message(told);
    d.set_offset_mins(nullptr, 1, 1);
    expect_message(told);
    d.destroy(nullptr);
    expect_no_message();
}

INSTANTIATE_TEST_SUITE_P(Flat, FlatDates, testing::ValuesIn(k_date_classes),
                         [](const auto& tested) { return std::string(tested.param.name); });

/// A field set through its function is the field got, and is in the text.
template <class T>
void expect_field(void* value, T (*get)(void*), void (*set)(void*, T), T wanted) {
    set(value, wanted);
    EXPECT_EQ(get(value), wanted);
}
#define EXPECT_FIELD(c, field, value, wanted) \
    expect_field(value, &CSharp_##c##_get_##field, &CSharp_##c##_set_##field, wanted)

TEST(FlatDateFields, AreThoseOfTheirClass) {
    void* value = CSharp_new_c_date__SWIG_0();
    EXPECT_FIELD(c_date, year, value, -2000);
    EXPECT_FIELD(c_date, month, value, 2U);
    EXPECT_FIELD(c_date, day, value, 3U);
    EXPECT_EQ(taken_text(CSharp_c_date_get_as_string(value)), "-2000-02-03");
    CSharp_delete_c_date(value);

    value = CSharp_new_c_datetime__SWIG_0();
    EXPECT_EQ(taken_text(CSharp_c_datetime_get_as_string(value)), "0001-00-00T00:00:00");
    EXPECT_FIELD(c_datetime, year, value, 2024);
    EXPECT_FIELD(c_datetime, month, value, 2U);
    EXPECT_FIELD(c_datetime, day, value, 3U);
    EXPECT_FIELD(c_datetime, hours, value, 4U);
    EXPECT_FIELD(c_datetime, mins, value, 5U);
    EXPECT_FIELD(c_datetime, secs, value, 6.5F);
    EXPECT_EQ(taken_text(CSharp_c_datetime_get_as_string(value)), "2024-02-03T04:05:06.5");
    CSharp_delete_c_datetime(value);

    value = CSharp_new_c_time__SWIG_0();
    EXPECT_FIELD(c_time, hours, value, 4U);
    EXPECT_FIELD(c_time, mins, value, 5U);
    EXPECT_FIELD(c_time, secs, value, 6.5F);
    EXPECT_EQ(taken_text(CSharp_c_time_get_as_string(value)), "04:05:06.5");
    CSharp_delete_c_time(value);

    value = CSharp_new_c_gday__SWIG_0();
    EXPECT_FIELD(c_gday, day, value, 3U);
    EXPECT_EQ(taken_text(CSharp_c_gday_get_as_string(value)), "---03");
    CSharp_delete_c_gday(value);

    value = CSharp_new_c_gmonth__SWIG_0();
    EXPECT_FIELD(c_gmonth, month, value, 5U);
    EXPECT_EQ(taken_text(CSharp_c_gmonth_get_as_string(value)), "--05--");
    CSharp_delete_c_gmonth(value);

    value = CSharp_new_c_gmonthday__SWIG_0();
    EXPECT_FIELD(c_gmonthday, month, value, 5U);
    EXPECT_FIELD(c_gmonthday, day, value, 6U);
    EXPECT_EQ(taken_text(CSharp_c_gmonthday_get_as_string(value)), "--05-06");
    CSharp_delete_c_gmonthday(value);

    value = CSharp_new_c_gyear__SWIG_0();
    EXPECT_FIELD(c_gyear, year, value, 2024);
    EXPECT_EQ(taken_text(CSharp_c_gyear_get_as_string(value)), "2024");
    CSharp_delete_c_gyear(value);

    value = CSharp_new_c_gyearmonth__SWIG_0();
    EXPECT_FIELD(c_gyearmonth, year, value, 2024);
    EXPECT_FIELD(c_gyearmonth, month, value, 7U);
    EXPECT_EQ(taken_text(CSharp_c_gyearmonth_get_as_string(value)), "2024-07");
    CSharp_delete_c_gyearmonth(value);
}

TEST(FlatDuration, HasItsFieldsAndNormalizes) {
    void* const value = CSharp_new_c_duration__SWIG_0();
    EXPECT_EQ(taken_text(CSharp_c_duration_get_as_string(value)), "P");
    EXPECT_FIELD(c_duration, is_neg, value, 1);
    EXPECT_FIELD(c_duration, years, value, 1U);
    EXPECT_FIELD(c_duration, months, value, 14U);
    EXPECT_FIELD(c_duration, days, value, 3U);
    EXPECT_FIELD(c_duration, hours, value, 4U);
    EXPECT_FIELD(c_duration, mins, value, 5U);
    EXPECT_FIELD(c_duration, secs, value, 90.0F);
    EXPECT_EQ(taken_text(CSharp_c_duration_get_as_string(value)), "-P1Y14M3DT4H5M90S");
    CSharp_c_duration_normalize(value);
    EXPECT_EQ(taken_text(CSharp_c_duration_get_as_string(value)), "-P2Y2M3DT4H6M30S");
    CSharp_delete_c_duration(value);

    void* const read = CSharp_new_c_duration__SWIG_1("PT1.5S");
    EXPECT_EQ(CSharp_c_duration_get_secs(read), 1.5F);
    CSharp_delete_c_duration(read);
    EXPECT_EQ(CSharp_c_duration_is_valid__SWIG_0("P1T1H"), 1);
    EXPECT_EQ(CSharp_c_duration_is_valid__SWIG_0("PT"), 0);
}

TEST(FlatDuration, ReportsNulls) {
    listen_for_nulls();
    EXPECT_EQ(CSharp_new_c_duration__SWIG_1(nullptr), nullptr);
    expect_message("null string");
    CSharp_c_duration_normalize(nullptr);
    expect_message("qbxV2::c_duration & type is null");
    EXPECT_EQ(CSharp_c_duration_get_secs(nullptr), 0.0F);
    expect_message("qbxV2::c_duration & type is null");
    CSharp_delete_c_duration(nullptr);
    expect_no_message();
}

}  // namespace
}  // namespace vrl_flat_driver
