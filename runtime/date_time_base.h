#pragma once

#include <cstddef>
#include <iosfwd>
#include <string>

#include "platform/api.h"
#include "runtime/date_time_record.h"

namespace qbxV2 {

/// What all date and time values share: the zone, and protected access to the other fields, of which each
/// class shows its own.
class VRL_API c_datetime_base {
public:
    c_datetime_base() = default;

    bool get_is_utc() const { return m_record.is_utc; }
    /// The offset stays.
    void set_is_utc(bool is_utc) { m_record.is_utc = is_utc; }
    /// Minutes east of UTC.
    int get_total_offset_mins() const { return m_record.total_offset_mins; }
    /// "Is UTC" stays.
    void set_total_offset_mins(int mins) { m_record.total_offset_mins = mins; }
    /// The offset becomes hours * 60 + mins, or hours * 60 - mins for negative hours. When that is not zero,
    /// "is UTC" becomes false.
    void set_offset(int hours, unsigned int mins);

protected:
    int get_year() const { return m_record.year; }
    void set_year(int year) { m_record.year = year; }
    unsigned int get_month() const { return m_record.month; }
    void set_month(unsigned int month) { m_record.month = month; }
    unsigned int get_day() const { return m_record.day; }
    void set_day(unsigned int day) { m_record.day = day; }
    unsigned int get_hours() const { return m_record.hours; }
    void set_hours(unsigned int hours) { m_record.hours = hours; }
    unsigned int get_mins() const { return m_record.mins; }
    void set_mins(unsigned int mins) { m_record.mins = mins; }
    float get_secs() const { return m_record.secs; }
    void set_secs(float secs) { m_record.secs = secs; }

    static bool is_valid_text(edatetime_kind kind, const char* text, std::size_t size);
    void parse_text(edatetime_kind kind, const char* text, std::size_t size);
    std::string text(edatetime_kind kind) const;
    void append_text(edatetime_kind kind, std::string& out) const;
    std::ostream& write_text(edatetime_kind kind, std::ostream& os) const;

    s_datetime_record m_record;
};

}  // namespace qbxV2
