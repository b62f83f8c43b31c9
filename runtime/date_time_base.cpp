#include "runtime/date_time_base.h"

#include <array>
#include <locale>
#include <ostream>
#include <sstream>

#include "runtime/date_time_form.h"
#include "runtime/date_time_parser.h"
#include "runtime/date_time_printer.h"
#include "runtime/stream_state.h"

namespace qbxV2 {
namespace {

constexpr std::streamsize k_default_precision = 6;

}  // namespace

void c_datetime_base::set_offset(int hours, unsigned int mins) {
    const unsigned int whole = static_cast<unsigned int>(hours) * 60U;
    m_record.total_offset_mins = static_cast<int>(hours < 0 ? whole - mins : whole + mins);
    if (m_record.total_offset_mins != 0) m_record.is_utc = false;
}

bool c_datetime_base::is_valid_text(edatetime_kind kind, const char* text, std::size_t size) {
    return detail::has_date_time_form(kind, text, size);
}

void c_datetime_base::parse_text(edatetime_kind kind, const char* text, std::size_t size) {
    detail::parse_date_time(kind, text, size, m_record);
}

std::string c_datetime_base::text(edatetime_kind kind) const {
    std::string result;
    if (std::locale() == std::locale::classic()) {
        append_text(kind, result);
        return result;
    }
    std::ostringstream os;
    detail::stream_date_time(kind, m_record, os);
    return os.str();
}

void c_datetime_base::append_text(edatetime_kind kind, std::string& out) const {
    std::array<char, detail::k_date_time_text_size> buffer;
    char* const start = buffer.data();
    out.append(start, detail::format_date_time(kind, m_record, start));
}

std::ostream& c_datetime_base::write_text(edatetime_kind kind, std::ostream& os) const {
    if (!detail::prints_plainly(os) || os.precision() != k_default_precision) {
        detail::stream_date_time(kind, m_record, os);
        return os;
    }
    os.fill('0');  // as the stream's own way leaves it
    std::array<char, detail::k_date_time_text_size> buffer;
    char* const start = buffer.data();
    return os.write(start, detail::format_date_time(kind, m_record, start) - start);
}

}  // namespace qbxV2
