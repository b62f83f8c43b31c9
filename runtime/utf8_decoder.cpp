#include "runtime/utf8_decoder.h"

#include "runtime/character_class.h"
#include "runtime/utf8.h"

namespace qbxV2 {
namespace {

constexpr int k_next_line = 0x85;
constexpr int k_line_separator = 0x2028;

char to_lower_ascii(char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c + ('a' - 'A')) : c; }

bool equals_ignoring_case(const char* a, const char* b) {
    for (; *a != '\0' && to_lower_ascii(*a) == to_lower_ascii(*b); ++a, ++b) {
    }
    return to_lower_ascii(*a) == to_lower_ascii(*b);
}

/// The bytes of a sequence by its first byte alone. A stray continuation byte stands for itself; sequences of
/// five and six bytes are refused later, but as a whole.
int sequence_length(int first) {
    if (first >= 0xFC) return 6;
    if (first >= 0xF8) return 5;
    if (first >= 0xF0) return 4;
    if (first >= 0xE0) return 3;
    if (first >= 0xC0) return 2;
    return 1;
}

bool is_ascii_but_nul(int c) { return c >= 1 && c <= 127; }
bool can_start_document(int c) { return detail::is_space(c) || c == '<'; }

}  // namespace

c_get_as_utf8::c_get_as_utf8(c_read& source, c_error& errors)
    : m_source(source), m_errors(errors), m_binder(errors) {
    m_binder.bind(this);
}

c_get_as_utf8::~c_get_as_utf8() = default;

void c_get_as_utf8::error(eqbx_error_type type, eqbx_error code, const char* message) const {
    m_errors.error(type, code, m_source.get_source_id(), get_line_num(), message);
}

void c_get_as_utf8::error(eqbx_error_type type, eqbx_error code, const std::string& message) const {
    error(type, code, message.c_str());
}

void c_get_as_utf8::use_runs(bool on) { block_runs(block_switched_off, !on); }

void c_get_as_utf8::unget(int c) {
    if (step_back(c)) return;
    m_unget.unget(c);
    block_runs(block_pushed_back, true);
}

/// Where the value is the very byte that was read last, moving the source back does the same as pushing the
/// value, and leaves the run open.
bool c_get_as_utf8::step_back(int c) {
    if (m_run_blocks != 0 || c < 0 || c >= 0x80) return false;
    c_read::s_run& run = m_source.m_run;
    if (run.next == run.begin || run.next[-1] != c) return false;
    note_look_ahead(run.next);
    --run.next;
    return true;
}

void c_get_as_utf8::rewind() {
    // A byte that was stepped back over counts as read: the source must not deliver it again.
    c_read::s_run& run = m_source.m_run;
    if (m_run_mark != nullptr && m_run_mark > run.next && m_run_mark <= run.end) run.next = m_run_mark;
    m_run_mark = nullptr;
    set_mode(ENCODING_UNKNOWN);
    m_previous = 0;
    m_unget.clear();
    block_runs(block_pushed_back, false);
    m_character[0] = 0;
    set_pending(nullptr);
    m_line = 1;
    m_source.rewind();
}

void c_get_as_utf8::set_mode(eqxp_encoding encoding) {
    m_encoding = encoding;
    block_runs(block_encoding, encoding != ENCODING_UTF8 && encoding != ENCODING_8BIT);
}

void c_get_as_utf8::set_pending(const unsigned char* pending) {
    m_pending = pending;
    block_runs(block_pending, pending != nullptr);
}

bool c_get_as_utf8::refill_run() {
    m_run_mark = nullptr;
    return m_source.fill_run() && m_source.m_run.next != m_source.m_run.end;
}

int c_get_as_utf8::read_byte() {
    c_read::s_run& run = m_source.m_run;
    if (run.next == run.end) {
        m_run_mark = nullptr;
        return m_source.read();
    }
    return (m_run_blocks & block_switched_off) != 0 ? m_source.read() : *run.next++;
}

int c_get_as_utf8::get_normalised() {
    int c = get_unit();
    if (c == '\n' && m_previous == '\r') c = get_unit();
    m_previous = c;
    if (c != '\r' && c != '\n') return c;
    ++m_line;
    return '\n';
}

int c_get_as_utf8::get_unit() {
    if (m_errors.is_fatal_errored()) return -1;
    if (!m_unget.empty()) {
        const int c = m_unget.get();
        block_runs(block_pushed_back, !m_unget.empty());
        return c;
    }
    if (m_pending != nullptr) {
        const int c = *m_pending;
        set_pending(m_pending[1] != 0 ? m_pending + 1 : nullptr);
        return c;
    }
    const int first = read_byte();
    if (first == -1) return -1;
    switch (m_encoding) {
        case ENCODING_UNKNOWN:
            return detect_encoding(first);
        case ENCODING_8BIT:
            // US-ASCII is read as ISO-8859-1: no test for bytes above 127.
            return first > 126 ? get_encoded(first) : first;
        case ENCODING_UTF8:
            return first > 127 ? get_multi_byte(first) : first;
        case ENCODING_UTF16_BE:
        case ENCODING_UTF16_LE:
        case ENCODING_UCS2_BE:
        case ENCODING_UCS2_LE:
            return get_wide_unit(first);
    }
    return -1;
}

int c_get_as_utf8::get_wide_unit(int first) {
    const bool big_endian = m_encoding == ENCODING_UTF16_BE || m_encoding == ENCODING_UCS2_BE;
    const int unit = join_16_bits(first, big_endian);
    if (unit == -1) return -1;
    const bool joins_surrogates = m_encoding == ENCODING_UTF16_BE || m_encoding == ENCODING_UTF16_LE;
    // Intended: a low surrogate without its high one passes as a code point.
    if (!joins_surrogates || unit < 0xD800 || unit > 0xDBFF) return get_encoded(unit);
    const int next = read_byte();
    const int low = next == -1 ? -1 : join_16_bits(next, big_endian);
    if (low == -1) return -1;
    if (low < 0xDC00 || low > 0xDFFF) return refuse_encoding();
    return get_encoded((((unit & 0x3FF) + 64) << 10) + (low & 0x3FF));
}

int c_get_as_utf8::join_16_bits(int first, bool big_endian) {
    const int second = read_byte();
    if (second == -1) return -1;
    return big_endian ? (first << 8) | second : (second << 8) | first;
}

int c_get_as_utf8::get_encoded(int code_point) {
    if (code_point == k_next_line || code_point == k_line_separator) return '\n';
    char bytes[8] = {0};
    unicode_char_to_utf8(code_point, bytes);
    for (unsigned i = 0; i < sizeof bytes; ++i) m_character[i] = static_cast<unsigned char>(bytes[i]);
    set_pending(m_character[1] != 0 ? m_character + 1 : nullptr);
    return m_character[0];
}

int c_get_as_utf8::get_multi_byte(int first) {
    read_multi_byte(first);
    // Intended: what is no UTF-8 looks like the end of input, without a report.
    if (m_character[0] == 0) return -1;
    set_pending(m_character[1] != 0 ? m_character + 1 : nullptr);
    return m_character[0];
}

/// Reads the rest of a sequence into `m_character`, whose first byte is 0 afterwards when the sequence is
/// invalid.
void c_get_as_utf8::read_multi_byte(int first) {
    const int length = sequence_length(first);
    m_character[0] = static_cast<unsigned char>(first);
    int last = first;
    for (int i = 1; i < length; ++i) {
        last = read_byte();
        m_character[i] = static_cast<unsigned char>(last);
    }
    m_character[length] = 0;
    if (last == -1) m_character[0] = 0;
    const bool next_line = m_character[0] == 0xC2 && m_character[1] == 0x85;
    const bool line_separator = m_character[0] == 0xE2 && m_character[1] == 0x80 && m_character[2] == 0xA8;
    if (next_line || line_separator) {
        m_character[0] = '\n';
        m_character[1] = 0;
    }
    if (!is_valid_utf8_char_sequence(reinterpret_cast<const char*>(m_character))) m_character[0] = 0;
}

int c_get_as_utf8::detect_encoding(int b0) {
    if (b0 == 0xFF || b0 == 0xFE || b0 == 0xEF) return detect_from_byte_order_mark(b0);
    if (b0 != 0 && !can_start_document(b0)) return refuse_encoding();
    const int b1 = read_byte();
    if (b0 == 0) {
        if (!can_start_document(b1)) return refuse_encoding();
        set_mode(ENCODING_UTF16_BE);
        return b1;
    }
    if (b1 == 0) {
        set_mode(ENCODING_UTF16_LE);
        return b0;
    }
    set_mode(ENCODING_UTF8);
    if (b1 != -1) {
        // Intended: an invalid sequence in second place comes out as the character NUL, not as the end of
        // input.
        read_multi_byte(b1);
        set_pending(m_character);
    }
    return b0;
}

int c_get_as_utf8::detect_from_byte_order_mark(int b0) {
    const int b1 = read_byte();
    if (b0 == 0xEF) {
        if (b1 != 0xBB || read_byte() != 0xBF) return refuse_encoding();
        set_mode(ENCODING_UTF8);
        return read_byte();
    }
    const bool little_endian = b0 == 0xFF;
    if (b1 != (little_endian ? 0xFE : 0xFF)) return refuse_encoding();
    const int c0 = read_byte();
    const int c1 = read_byte();
    const int character = little_endian ? c0 : c1;
    if (!is_ascii_but_nul(character) || (little_endian ? c1 : c0) != 0) return refuse_encoding();
    set_mode(little_endian ? ENCODING_UTF16_LE : ENCODING_UTF16_BE);
    return character;
}

int c_get_as_utf8::refuse_encoding() {
    error(EQBX_ET_FATAL, EQBX_BAD_CHAR_ENCODING, "Unrecognised character encoding");
    return -1;
}

bool c_get_as_utf8::set_encoding(const char* name) {
    const bool wide = m_encoding == ENCODING_UTF16_BE || m_encoding == ENCODING_UTF16_LE;
    const bool utf8 = m_encoding == ENCODING_UTF8;
    if (equals_ignoring_case(name, "ISO-10646-UCS-2")) {
        if (wide) set_mode(m_encoding == ENCODING_UTF16_BE ? ENCODING_UCS2_BE : ENCODING_UCS2_LE);
        return wide || refuse_mismatch();
    }
    if (equals_ignoring_case(name, "ISO-8859-1") || equals_ignoring_case(name, "US-ASCII")) {
        set_mode(ENCODING_8BIT);
        return utf8 || refuse_mismatch();
    }
    if (equals_ignoring_case(name, "UTF-8")) return utf8 || refuse_mismatch();
    if (equals_ignoring_case(name, "UTF-16")) return wide || refuse_mismatch();
    error(EQBX_ET_FATAL, EQBX_BAD_CHAR_ENCODING, "Unknown character encoding specified");
    return false;
}

bool c_get_as_utf8::refuse_mismatch() {
    error(EQBX_ET_FATAL, EQBX_ENCODING_MISMATCH, "Mis-match between specfied encoding and byte format");
    return false;
}

}  // namespace qbxV2
