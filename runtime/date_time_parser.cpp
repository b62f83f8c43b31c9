#include "runtime/date_time_parser.h"

#include <cstdint>

#include "runtime/text_cursor.h"

namespace qbxV2::detail {
namespace {

/// One parse. Each step is false when the parser has to stop there.
class date_time_parser {
public:
    date_time_parser(const char* text, std::size_t size, s_datetime_record& record)
        : m_cursor(text, size), m_record(record) {}

    void run(edatetime_kind kind) {
        switch (kind) {
            case EDT_DATE:
                if (date() && zone()) apply_sign();
                break;
            case EDT_DATETIME:
                if (date() && accept('T') && time()) {
                    apply_sign();
                    zone();
                }
                break;
            case EDT_TIME:
                if (time()) zone();
                break;
            case EDT_GDAY:
                if (dashes(3) && number(m_record.day) != 0) zone();
                break;
            case EDT_GMONTH:
                if (dashes(2) && two_digits(m_record.month) && dashes(2)) zone();
                break;
            case EDT_GMONTHDAY:
                if (dashes(2) && two_digits(m_record.month) && dashes(1) && number(m_record.day) != 0) zone();
                break;
            case EDT_GYEAR:
                if (year() && zone()) apply_sign();
                break;
            case EDT_GYEARMONTH:
                if (year() && dashes(1) && two_digits(m_record.month) && zone()) apply_sign();
                break;
        }
    }

private:
    bool accept(char c) { return m_cursor.accept(c); }

    bool dashes(int count) {
        for (; count > 0; --count) {
            if (!accept('-')) return false;
        }
        return true;
    }

    std::size_t number(unsigned int& field) {
        std::uint32_t value = 0;
        const std::size_t count = m_cursor.read_digits(value);
        field = value;
        return count;
    }

    bool two_digits(unsigned int& field) { return number(field) == 2; }

    bool year() {
        m_negative = m_cursor.accept_sign();
        unsigned int value = 0;
        const std::size_t count = number(value);
        m_record.year = static_cast<int>(value);
        return count >= 4;
    }

    void apply_sign() {
        if (m_negative) m_record.year = static_cast<int>(0U - static_cast<unsigned int>(m_record.year));
    }

    bool date() {
        return year() && dashes(1) && two_digits(m_record.month) && dashes(1) && two_digits(m_record.day);
    }

    bool time() {
        return two_digits(m_record.hours) && accept(':') && two_digits(m_record.mins) && accept(':') &&
               seconds();
    }

    /// Summed in single precision, each step rounded, as the text is walked.
    bool seconds() {
        const char* const start = m_cursor.position();
        float value = 0.0F;
        for (int digit = 0; next_digit(digit);) value = static_cast<float>(value * 10.0 + digit);
        if (accept('.')) {
            float factor = 0.1F;
            for (int digit = 0; next_digit(digit);) {
                value = static_cast<float>(value + static_cast<double>(factor) * digit);
                factor = static_cast<float>(factor / 10.0);
            }
        }
        m_record.secs = value;
        return m_cursor.position() - start >= 2;
    }

    bool next_digit(int& digit) {
        if (m_cursor.at_end() || !is_ascii_digit(*m_cursor.position())) return false;
        digit = *m_cursor.position() - '0';
        return accept(*m_cursor.position());
    }

    bool zone() {
        if (m_cursor.at_end()) return set_zone(false, 0);
        if (accept('Z')) return m_cursor.at_end() && set_zone(true, 0);
        const bool west = accept('-');
        if (!west && !accept('+')) return false;
        unsigned int hours = 0;
        unsigned int mins = 0;
        if (!two_digits(hours) || !accept(':') || !two_digits(mins) || !m_cursor.at_end()) return false;
        const int offset = static_cast<int>(hours * 60 + mins);
        return set_zone(false, west ? -offset : offset);
    }

    bool set_zone(bool is_utc, int offset) {
        m_record.is_utc = is_utc;
        m_record.total_offset_mins = offset;
        return true;
    }

    text_cursor m_cursor;
    s_datetime_record& m_record;
    bool m_negative = false;
};

}  // namespace

void parse_date_time(edatetime_kind kind, const char* text, std::size_t size, s_datetime_record& record) {
    date_time_parser(text, size, record).run(kind);
}

}  // namespace qbxV2::detail
