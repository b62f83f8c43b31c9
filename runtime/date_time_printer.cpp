#include "runtime/date_time_printer.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <iomanip>
#include <ostream>

#include "runtime/number_text.h"

namespace qbxV2::detail {
namespace {

bool needs_fixed(float secs) { return secs != 0.0F && static_cast<double>(secs) < 0.001; }

/// Where the text goes: a buffer, formatted here.
class buffer_sink {
public:
    explicit buffer_sink(char* out) : m_at(out) {}

    void put(char c) { *m_at++ = c; }

    void number(int value, int width) {
        if (value >= 0) return number(static_cast<unsigned int>(value), width);
        padded(value, width);
    }

    void number(unsigned int value, int width) {
        if (width == 2 && value < 100) return two_digits(value);
        if (width == 4 && value < 10000) {
            two_digits(value / 100);
            return two_digits(value % 100);
        }
        padded(value, width);
    }

    void seconds(float secs) { m_at = format_seconds(secs, m_at); }
    char* end() const { return m_at; }

private:
    void two_digits(unsigned int value) {
        put(static_cast<char>('0' + value / 10));
        put(static_cast<char>('0' + value % 10));
    }

    template <typename Number>
    void padded(Number value, int width) {
        char digits[16];
        char* const end = std::to_chars(digits, digits + sizeof digits, value).ptr;
        for (auto missing = width - (end - digits); missing > 0; --missing) put('0');
        m_at = std::copy(digits, end, m_at);
    }

    char* m_at;
};

/// Where the text goes: a stream, formatted by it.
class stream_sink {
public:
    explicit stream_sink(std::ostream& os) : m_os(os) { m_os.fill('0'); }

    void put(char c) { m_os << c; }

    template <typename Number>
    void number(Number value, int width) {
        m_os << std::setw(width) << value;
    }

    void seconds(float secs) { stream_seconds(secs, m_os); }

private:
    std::ostream& m_os;
};

template <typename Sink>
void put_date(const s_datetime_record& record, Sink& sink) {
    sink.number(record.year, 4);
    sink.put('-');
    sink.number(record.month, 2);
    sink.put('-');
    sink.number(record.day, 2);
}

template <typename Sink>
void put_time(const s_datetime_record& record, Sink& sink) {
    sink.number(record.hours, 2);
    sink.put(':');
    sink.number(record.mins, 2);
    sink.put(':');
    if (record.secs < 10.0F) sink.put('0');
    sink.seconds(record.secs);
}

template <typename Sink>
void put_zone(const s_datetime_record& record, Sink& sink) {
    if (record.is_utc) {
        sink.put('Z');
        return;
    }
    const int offset = record.total_offset_mins;
    if (offset == 0) return;
    const auto magnitude =
        offset < 0 ? 0U - static_cast<unsigned int>(offset) : static_cast<unsigned int>(offset);
    sink.put(offset < 0 ? '-' : '+');
    sink.number(magnitude / 60, 2);
    sink.put(':');
    sink.number(magnitude % 60, 2);
}

template <typename Sink>
void put_dashes(int count, Sink& sink) {
    for (; count > 0; --count) sink.put('-');
}

template <typename Sink>
void put_value(edatetime_kind kind, const s_datetime_record& record, Sink& sink) {
    switch (kind) {
        case EDT_DATE:
            put_date(record, sink);
            break;
        case EDT_DATETIME:
            put_date(record, sink);
            sink.put('T');
            put_time(record, sink);
            break;
        case EDT_TIME:
            put_time(record, sink);
            break;
        case EDT_GDAY:
            put_dashes(3, sink);
            sink.number(record.day, 2);
            break;
        case EDT_GMONTH:
            put_dashes(2, sink);
            sink.number(record.month, 2);
            put_dashes(2, sink);
            break;
        case EDT_GMONTHDAY:
            put_dashes(2, sink);
            sink.number(record.month, 2);
            sink.put('-');
            sink.number(record.day, 2);
            break;
        case EDT_GYEAR:
            sink.number(record.year, 4);
            break;
        case EDT_GYEARMONTH:
            sink.number(record.year, 4);
            sink.put('-');
            sink.number(record.month, 2);
            break;
    }
    put_zone(record, sink);
}

}  // namespace

char* format_date_time(edatetime_kind kind, const s_datetime_record& record, char* out) {
    buffer_sink sink(out);
    put_value(kind, record, sink);
    return sink.end();
}

void stream_date_time(edatetime_kind kind, const s_datetime_record& record, std::ostream& os) {
    stream_sink sink(os);
    put_value(kind, record, sink);
}

char* format_seconds(float secs, char* out) {
    constexpr int k_precision = 6;  // a stream's default
    // Most seconds are whole; they need none of the machinery for fractions.
    if (secs >= 0.0F && secs < 100.0F) {
        const auto whole = static_cast<unsigned int>(secs);
        if (static_cast<float>(whole) == secs && !std::signbit(secs))
            return std::to_chars(out, out + 2, whole).ptr;
    }
    const auto value = static_cast<double>(secs);
    if (needs_fixed(secs))
        return std::to_chars(out, out + 64, value, std::chars_format::fixed, k_precision).ptr;
    return out + format_general(out, value, k_precision);
}

void stream_seconds(float secs, std::ostream& os) {
    if (needs_fixed(secs)) os.setf(std::ios_base::fixed, std::ios_base::floatfield);
    os << secs;
    os.unsetf(std::ios_base::fixed);
}

}  // namespace qbxV2::detail
