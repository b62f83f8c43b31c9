#include "runtime/duration.h"

#include <array>
#include <cmath>
#include <cstdint>
#include <locale>
#include <ostream>
#include <sstream>
#include <tuple>

#include "runtime/date_time_printer.h"
#include "runtime/number_text.h"
#include "runtime/stream_state.h"
#include "runtime/text_cursor.h"

namespace qbxV2 {

using detail::text_cursor;

namespace {

constexpr std::streamsize k_default_precision = 6;

enum class field { sign, years, months, days, hours, mins, secs };

/// The way through the text that check and parser share: numbers, each of which waits for its letter. `Take`
/// is told each field that is met, and the text of its number.
template <typename Take>
class duration_walk {
public:
    duration_walk(const char* text, std::size_t size, Take take) : m_cursor(text, size), m_take(take) {}

    /// True when the text is a duration.
    bool run() {
        if (m_cursor.accept_sign()) m_take(field::sign, m_cursor.position(), 0);
        if (!m_cursor.accept('P')) return false;
        read_number();
        if (m_pending && designator('Y', field::years)) read_number();
        if (m_pending && designator('M', field::months)) read_number();
        if (m_pending) designator('D', field::days);
        if (m_cursor.at_end()) return !m_pending;
        return m_cursor.accept('T') && !m_cursor.at_end() && run_time();
    }

private:
    bool run_time() {
        // Intended: a number that met no letter before the "T" still waits here, so "P1T1H" and "P1TH" pass.
        read_number();
        if (m_pending && designator('H', field::hours)) read_number();
        if (m_pending && designator('M', field::mins)) read_number();
        bool has_fraction = false;
        if (m_cursor.accept('.')) {
            if (m_cursor.at_end()) return false;
            has_fraction = m_cursor.skip_digits() != 0;
        }
        if (!has_fraction && !m_pending) return m_cursor.at_end();
        return designator('S', field::secs) && m_cursor.at_end();
    }

    void read_number() {
        m_number = m_cursor.position();
        if (m_cursor.skip_digits() != 0) m_pending = true;
    }

    /// Whether the letter stands here, so that the number has met it.
    bool designator(char letter, field met) {
        const char* const end = m_cursor.position();
        if (!m_cursor.accept(letter)) return false;
        m_take(met, m_number, static_cast<std::size_t>(end - m_number));
        m_pending = false;
        return true;
    }

    text_cursor m_cursor;
    Take m_take;
    const char* m_number = nullptr;
    bool m_pending = false;
};

struct ignore_fields {
    void operator()(field /*met*/, const char* /*number*/, std::size_t /*size*/) const {}
};

unsigned int text_to_field(const char* number, std::size_t size) {
    return static_cast<unsigned int>(text_to_int(number, size));
}

/// Where the text goes: a string, formatted here at precision 6 in the classic locale.
class text_sink {
public:
    explicit text_sink(std::string& out) : m_out(out) {}
    void put(char c) { m_out.push_back(c); }
    void number(unsigned int value) { append_unsigned(m_out, value); }
    void seconds(float secs) {
        std::array<char, detail::k_date_time_text_size> text;
        m_out.append(text.data(), detail::format_seconds(secs, text.data()));
    }

private:
    std::string& m_out;
};

/// Where the text goes: a stream, formatted by it.
class stream_sink {
public:
    explicit stream_sink(std::ostream& os) : m_os(os) {}
    void put(char c) { m_os << c; }
    void number(unsigned int value) { m_os << value; }
    void seconds(float secs) { detail::stream_seconds(secs, m_os); }

private:
    std::ostream& m_os;
};

template <typename Sink>
void put_number(unsigned int value, char letter, Sink& sink) {
    if (value == 0) return;
    sink.number(value);
    sink.put(letter);
}

template <typename Sink>
void put_value(const c_duration& d, Sink& sink) {
    if (d.get_is_neg()) sink.put('-');
    sink.put('P');
    put_number(d.get_years(), 'Y', sink);
    put_number(d.get_months(), 'M', sink);
    put_number(d.get_days(), 'D', sink);
    const bool has_secs = d.get_secs() != 0.0F;
    if (d.get_hours() == 0 && d.get_mins() == 0 && !has_secs) return;
    sink.put('T');
    put_number(d.get_hours(), 'H', sink);
    put_number(d.get_mins(), 'M', sink);
    if (!has_secs) return;
    sink.seconds(d.get_secs());
    sink.put('S');
}

/// Days from the first of a year, or of any month, to the end of that many months: at least, and at most.
constexpr std::array<std::uint64_t, 12> k_min_days = {0, 28, 59, 89, 120, 150, 181, 212, 242, 273, 303, 334};
constexpr std::array<std::uint64_t, 12> k_max_days = {0, 31, 62, 92, 123, 153, 184, 215, 245, 276, 306, 337};

c_duration normalized(c_duration value) {
    value.normalize();
    return value;
}

auto key_of(const c_duration& d) {
    return std::make_tuple(d.get_years(), d.get_months(), d.get_days(), d.get_hours(), d.get_mins(),
                           d.get_secs());
}

std::uint64_t earliest_day(const c_duration& d, std::uint64_t years) {
    return k_min_days[d.get_months()] + years * 365 + d.get_days();
}

std::uint64_t latest_day(const c_duration& d, std::uint64_t years) {
    return k_max_days[d.get_months()] + years * 366 + d.get_days();
}

/// Whether the order depends on which months are meant. Both are normalised; only surplus years are counted.
bool have_overlapping_days(const c_duration& a, const c_duration& b) {
    const std::uint64_t a_years = a.get_years() > b.get_years() ? a.get_years() - b.get_years() : 0;
    const std::uint64_t b_years = b.get_years() > a.get_years() ? b.get_years() - a.get_years() : 0;
    if (latest_day(a, a_years) <= earliest_day(b, b_years)) return false;
    return earliest_day(a, a_years) < latest_day(b, b_years);
}

enum class comparison { indeterminate, same, longer, shorter };

comparison compare(const c_duration& a, const c_duration& b) {
    const c_duration na = normalized(a);
    const c_duration nb = normalized(b);
    const bool may_overlap = a.get_is_neg() == b.get_is_neg() && a.get_months() % 12 != b.get_months() % 12;
    if (may_overlap && have_overlapping_days(na, nb)) return comparison::indeterminate;
    // Intended: the sign takes part in equality alone.
    if (a.get_is_neg() == b.get_is_neg() && key_of(na) == key_of(nb)) return comparison::same;
    return key_of(na) > key_of(nb) ? comparison::longer : comparison::shorter;
}

}  // namespace

c_duration& c_duration::parse(const char* text, std::size_t size) {
    *this = c_duration();
    const auto take = [this](field met, const char* number, std::size_t length) {
        switch (met) {
            case field::sign:
                m_is_neg = true;
                break;
            case field::years:
                m_years = text_to_field(number, length);
                break;
            case field::months:
                m_months = text_to_field(number, length);
                break;
            case field::days:
                m_days = text_to_field(number, length);
                break;
            case field::hours:
                m_hours = text_to_field(number, length);
                break;
            case field::mins:
                m_mins = text_to_field(number, length);
                break;
            case field::secs:
                m_secs = static_cast<float>(text_to_double(number, length));
                break;
        }
    };
    duration_walk(text, size, take).run();
    return *this;
}

void c_duration::normalize() {
    constexpr double k_limit = 4294967296.0;
    const double whole_mins = std::trunc(static_cast<double>(m_secs) / 60.0);
    // Negative seconds borrow from the minutes, modulo 2^32 like all that follows.
    if (whole_mins > -k_limit && whole_mins < k_limit) {
        m_mins += static_cast<unsigned int>(static_cast<std::int64_t>(whole_mins));
        m_secs = static_cast<float>(m_secs - whole_mins * 60.0);
    }
    m_hours += m_mins / 60;
    m_mins %= 60;
    m_days += m_hours / 24;
    m_hours %= 24;
    m_years += m_months / 12;
    m_months %= 12;
}

std::string c_duration::get_as_string() const {
    if (std::locale() == std::locale::classic()) {
        std::string result;
        append_text(result);
        return result;
    }
    std::ostringstream os;
    os << *this;
    return os.str();
}

void c_duration::append_text(std::string& out) const {
    text_sink sink(out);
    put_value(*this, sink);
}

bool c_duration::is_valid(const std::string& text) { return is_valid(text.data(), text.size()); }
bool c_duration::is_valid(const char* text) {
    return is_valid(text, text ? std::char_traits<char>::length(text) : 0);
}
bool c_duration::is_valid(const char* text, std::size_t size) {
    return duration_walk(text, size, ignore_fields()).run();
}

std::ostream& operator<<(std::ostream& os, const c_duration& value) {
    if (detail::prints_plainly(os) && os.precision() == k_default_precision) {
        std::string text;
        value.append_text(text);
        return os.write(text.data(), static_cast<std::streamsize>(text.size()));
    }
    stream_sink sink(os);
    put_value(value, sink);
    return os;
}

bool operator==(const c_duration& a, const c_duration& b) { return compare(a, b) == comparison::same; }
bool operator!=(const c_duration& a, const c_duration& b) { return compare(a, b) != comparison::same; }
bool operator<(const c_duration& a, const c_duration& b) { return compare(a, b) == comparison::shorter; }
bool operator>(const c_duration& a, const c_duration& b) { return compare(a, b) == comparison::longer; }

bool operator<=(const c_duration& a, const c_duration& b) {
    const comparison order = compare(a, b);
    return order == comparison::shorter || order == comparison::same;
}

bool operator>=(const c_duration& a, const c_duration& b) {
    const comparison order = compare(a, b);
    return order == comparison::longer || order == comparison::same;
}

}  // namespace qbxV2
