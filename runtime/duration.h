#pragma once

#include <cstddef>
#include <iosfwd>
#include <string>

#include "platform/api.h"

namespace qbxV2 {

/// An XML Schema duration, as it was given: 90 seconds stay 90 seconds until `normalize`.
///
/// Parsing clears the value, then stops at the first thing that does not fit, keeping what it has read. A
/// null pointer counts as the empty text. Source  XML Schema Part 2, 3.2.6 duration.
class VRL_API c_duration {
public:
    c_duration() = default;
    c_duration(const std::string& text) { parse(text.data(), text.size()); }
    c_duration(const char* text) { *this = text; }
    c_duration& operator=(const std::string& text) { return parse(text.data(), text.size()); }
    c_duration& operator=(const char* text) {
        return parse(text, text ? std::char_traits<char>::length(text) : 0);
    }
    /// The assignment from the `size` bytes at `text`, which need no terminator.
    c_duration& parse(const char* text, std::size_t size);

    bool get_is_neg() const { return m_is_neg; }
    void set_is_neg(bool is_neg) { m_is_neg = is_neg; }
    unsigned int get_years() const { return m_years; }
    void set_years(unsigned int years) { m_years = years; }
    unsigned int get_months() const { return m_months; }
    void set_months(unsigned int months) { m_months = months; }
    unsigned int get_days() const { return m_days; }
    void set_days(unsigned int days) { m_days = days; }
    unsigned int get_hours() const { return m_hours; }
    void set_hours(unsigned int hours) { m_hours = hours; }
    unsigned int get_mins() const { return m_mins; }
    void set_mins(unsigned int mins) { m_mins = mins; }
    float get_secs() const { return m_secs; }
    void set_secs(float secs) { m_secs = secs; }

    /// Carries seconds into minutes, these into hours, these into days, and months into years. Never days
    /// into months. Seconds that are no number, or whose minutes pass 32 bits, stay as they are.
    void normalize();

    /// Fields that are zero are left out; all of them zero is "P". Precision 6, in the process's C++ locale.
    std::string get_as_string() const;
    /// Appends the text at precision 6, in the classic locale.
    void append_text(std::string& out) const;

    /// "P", then numbers with Y, M, D in this order, then "T" with numbers and H, M, S. "P" alone passes,
    /// "PT" does not. Intended: a number left before "T" passes, as in "P1T1H".
    [[nodiscard]] static bool is_valid(const std::string& text);
    [[nodiscard]] static bool is_valid(const char* text);
    [[nodiscard]] static bool is_valid(const char* text, std::size_t size);

private:
    bool m_is_neg = false;
    unsigned int m_years = 0;
    unsigned int m_months = 0;
    unsigned int m_days = 0;
    unsigned int m_hours = 0;
    unsigned int m_mins = 0;
    float m_secs = 0.0F;
};

/// Writes the text at the stream's precision. Where seconds are written, the stream's fixed notation is off
/// afterwards.
VRL_API std::ostream& operator<<(std::ostream& os, const c_duration& value);

/// Compare normalised copies. For a pair whose order depends on which months are meant (P1M and P30D) only
/// `!=` holds. Intended: the sign takes no part in the order, so -P2Y is longer than P1Y.
VRL_API bool operator==(const c_duration& a, const c_duration& b);
VRL_API bool operator!=(const c_duration& a, const c_duration& b);
VRL_API bool operator<(const c_duration& a, const c_duration& b);
VRL_API bool operator<=(const c_duration& a, const c_duration& b);
VRL_API bool operator>(const c_duration& a, const c_duration& b);
VRL_API bool operator>=(const c_duration& a, const c_duration& b);

}  // namespace qbxV2
