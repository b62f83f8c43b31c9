#pragma once

#include <cstddef>
#include <iosfwd>
#include <string>

#include "platform/api.h"
#include "runtime/date_time_base.h"

namespace qbxV2 {

/// The operations that the eight date and time classes have alike. `Value` is the class itself.
///
/// Check    `is_valid` tells whether a text has the class's form. Ranges are not tested: month 13 and
/// "+99:99" pass.
///          A sign before the year may be "+" too.
/// Parsing  reads a text in the order of the form and stops at the first thing that does not fit, keeping
/// what it has
///          stored. An assignment does not clear the fields first. A null pointer counts as the empty text.
/// Text     the form again; year in width 4, other whole fields in width 2; seconds at the stream's
/// precision; then
///          "Z" if is UTC, else "+hh:mm" or "-hh:mm" if the offset is not zero. Writing leaves the stream's
///          fill character at "0" and, where seconds are written, its fixed notation switched off.
/// Source   XML Schema Part 2, 3.2.7 to 3.2.14, with the liberties above.
template <typename Value, edatetime_kind kind>
class ct_datetime_value : public c_datetime_base {
public:
    ct_datetime_value() = default;
    ct_datetime_value(const std::string& text) { parse_text(kind, text.data(), text.size()); }
    ct_datetime_value(const char* text) { *this = text; }

    Value& operator=(const std::string& text) { return parse(text.data(), text.size()); }
    Value& operator=(const char* text) {
        return parse(text, text ? std::char_traits<char>::length(text) : 0);
    }
    /// The assignment from the `size` bytes at `text`, which need no terminator.
    Value& parse(const char* text, std::size_t size) {
        parse_text(kind, text, size);
        return static_cast<Value&>(*this);
    }

    [[nodiscard]] static bool is_valid(const std::string& text) {
        return is_valid_text(kind, text.data(), text.size());
    }
    [[nodiscard]] static bool is_valid(const char* text, std::size_t size) {
        return is_valid_text(kind, text, size);
    }

    /// The text at precision 6, in the process's C++ locale.
    std::string get_as_string() const { return text(kind); }
    /// Appends the text at precision 6, in the classic locale.
    void append_text(std::string& out) const { c_datetime_base::append_text(kind, out); }
    /// The stream operator.
    std::ostream& write(std::ostream& os) const { return write_text(kind, os); }

protected:
    explicit ct_datetime_value(const c_datetime_base& other) : c_datetime_base(other) {}
};

template <typename Value, edatetime_kind kind>
std::ostream& operator<<(std::ostream& os, const ct_datetime_value<Value, kind>& value) {
    return value.write(os);
}

/// [+-]yyyy-mm-dd
class VRL_API c_date : public ct_datetime_value<c_date, EDT_DATE> {
public:
    using ct_datetime_value::ct_datetime_value;
    using ct_datetime_value::operator=;
    c_date() = default;
    /// All fields of another value, so that it can be compared.
    explicit c_date(const c_datetime_base& other) : ct_datetime_value(other) {}

    using c_datetime_base::get_day;
    using c_datetime_base::get_month;
    using c_datetime_base::get_year;
    using c_datetime_base::set_day;
    using c_datetime_base::set_month;
    using c_datetime_base::set_year;

private:
    friend VRL_API bool operator==(const c_date& a, const c_date& b);
    friend VRL_API bool operator<(const c_date& a, const c_date& b);
};

/// [+-]yyyy-mm-ddThh:mm:ss[.s]
class VRL_API c_datetime : public ct_datetime_value<c_datetime, EDT_DATETIME> {
public:
    using ct_datetime_value::ct_datetime_value;
    using ct_datetime_value::operator=;
    c_datetime() = default;

    using c_datetime_base::get_day;
    using c_datetime_base::get_hours;
    using c_datetime_base::get_mins;
    using c_datetime_base::get_month;
    using c_datetime_base::get_secs;
    using c_datetime_base::get_year;
    using c_datetime_base::set_day;
    using c_datetime_base::set_hours;
    using c_datetime_base::set_mins;
    using c_datetime_base::set_month;
    using c_datetime_base::set_secs;
    using c_datetime_base::set_year;
};

/// hh:mm:ss[.s]. Intended: a sign in front passes `is_valid`, and makes parsing stop at once.
class VRL_API c_time : public ct_datetime_value<c_time, EDT_TIME> {
public:
    using ct_datetime_value::ct_datetime_value;
    using ct_datetime_value::operator=;
    c_time() = default;

    using c_datetime_base::get_hours;
    using c_datetime_base::get_mins;
    using c_datetime_base::get_secs;
    using c_datetime_base::set_hours;
    using c_datetime_base::set_mins;
    using c_datetime_base::set_secs;
};

/// ---dd
class VRL_API c_gday : public ct_datetime_value<c_gday, EDT_GDAY> {
public:
    using ct_datetime_value::ct_datetime_value;
    using ct_datetime_value::operator=;
    c_gday() = default;

    using c_datetime_base::get_day;
    using c_datetime_base::set_day;
};

/// --mm--
class VRL_API c_gmonth : public ct_datetime_value<c_gmonth, EDT_GMONTH> {
public:
    using ct_datetime_value::ct_datetime_value;
    using ct_datetime_value::operator=;
    c_gmonth() = default;

    using c_datetime_base::get_month;
    using c_datetime_base::set_month;
};

/// --mm-dd
class VRL_API c_gmonthday : public ct_datetime_value<c_gmonthday, EDT_GMONTHDAY> {
public:
    using ct_datetime_value::ct_datetime_value;
    using ct_datetime_value::operator=;
    c_gmonthday() = default;

    using c_datetime_base::get_day;
    using c_datetime_base::get_month;
    using c_datetime_base::set_day;
    using c_datetime_base::set_month;
};

/// [+-]yyyy
class VRL_API c_gyear : public ct_datetime_value<c_gyear, EDT_GYEAR> {
public:
    using ct_datetime_value::ct_datetime_value;
    using ct_datetime_value::operator=;
    c_gyear() = default;

    using c_datetime_base::get_year;
    using c_datetime_base::set_year;
};

/// [+-]yyyy-mm
class VRL_API c_gyearmonth : public ct_datetime_value<c_gyearmonth, EDT_GYEARMONTH> {
public:
    using ct_datetime_value::ct_datetime_value;
    using ct_datetime_value::operator=;
    c_gyearmonth() = default;

    using c_datetime_base::get_month;
    using c_datetime_base::get_year;
    using c_datetime_base::set_month;
    using c_datetime_base::set_year;
};

using tc_datetime = c_datetime;

/// By year, month, day, hours, mins, secs, in this order. The zone takes no part: 12:00Z and 12:00+05:00 are
/// equal.
VRL_API bool operator==(const c_date& a, const c_date& b);
VRL_API bool operator!=(const c_date& a, const c_date& b);
VRL_API bool operator<(const c_date& a, const c_date& b);
VRL_API bool operator<=(const c_date& a, const c_date& b);
VRL_API bool operator>(const c_date& a, const c_date& b);
VRL_API bool operator>=(const c_date& a, const c_date& b);

}  // namespace qbxV2
