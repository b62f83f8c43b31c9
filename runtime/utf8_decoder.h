#pragma once

#include <string>

#include "platform/api.h"
#include "runtime/byte_source.h"
#include "runtime/error.h"

namespace qbxV2 {

/// A stack of at most three values. A fourth push is lost; a pop from the empty stack gives -1.
class c_unget_buffer {
public:
    void unget(int c) {
        if (m_count < k_capacity) m_values[m_count++] = c;
    }
    int get() { return m_count > 0 ? m_values[--m_count] : -1; }
    bool empty() const { return m_count == 0; }
    void clear() { m_count = 0; }

private:
    static constexpr unsigned k_capacity = 3;
    int m_values[k_capacity] = {0, 0, 0};
    unsigned m_count = 0;
};

/// How the bytes of the input are read. Unknown until the first byte.
enum eqxp_encoding : int {
    ENCODING_UNKNOWN = 0,
    ENCODING_8BIT = 1,  ///< ISO-8859-1, and US-ASCII read as such
    ENCODING_UTF8 = 2,
    ENCODING_UTF16_BE = 3,
    ENCODING_UTF16_LE = 4,
    ENCODING_UCS2_BE = 5,  ///< as UTF-16, but surrogates are not joined
    ENCODING_UCS2_LE = 6
};

/// Turns the bytes of a source, in any supported encoding, into UTF-8 with line feeds for line ends.
///
/// Values are bytes 0 to 255, or -1 for the end of input. A byte sequence that is no UTF-8 looks like the end
/// of input too; what is fatal is reported to the error record, and after a fatal report every read gives -1.
///
/// Runs. While the bytes of the source are the values that `get` would give (a byte-wise encoding, nothing
/// pushed back, no character half delivered), `open_run` shows them where they lie, and `take_run` consumes
/// some of them. Reading that way and through `get` gives the same values and the same line numbers.
class VRL_API c_get_as_utf8 {
public:
    /// Reads from `source` and reports to `errors`; both must outlive this object (though the destructor
    /// leaves the source alone). Names itself in reports from here on.
    c_get_as_utf8(c_read& source, c_error& errors);
    c_get_as_utf8(const c_get_as_utf8&) = delete;
    c_get_as_utf8& operator=(const c_get_as_utf8&) = delete;
    virtual ~c_get_as_utf8();

    /// The next byte of UTF-8 with CR, LF and CR LF as one 10, or -1.
    int get() {
        int c;
        return get_plain(&c) ? c : get_normalised();
    }
    /// Pushes a value back, -1 too. Up to three.
    void unget(int c);
    /// Back to the start of the source and to encoding detection. The error record stays.
    void rewind();
    /// Declares the encoding by name, ASCII case ignored: ISO-10646-UCS-2, ISO-8859-1, US-ASCII, UTF-8 or
    /// UTF-16. False after a fatal report: EQBX_BAD_CHAR_ENCODING for another name, EQBX_ENCODING_MISMATCH
    /// for one that contradicts the bytes seen so far.
    bool set_encoding(const char* name);
    eqxp_encoding get_encoding() const { return m_encoding; }

    /// The line of the next value, from 1. A line feed that is pushed back and read again counts twice.
    int get_line_num() const { return static_cast<int>(m_line); }
    const char* get_source_id() const { return m_source.get_source_id(); }
    c_error& get_error_handler() const { return m_errors; }
    /// Records a report with this getter's own source name and line.
    void error(eqbx_error_type type, eqbx_error code, const char* message) const;
    void error(eqbx_error_type type, eqbx_error code, const std::string& message) const;

    /// Switches the work on runs off or on. On by default. Results are the same; only the speed differs.
    void use_runs(bool on);

    /// Bytes that `get` would hand out one by one, unchanged, as long as each is ASCII and none is CR.
    struct s_byte_run {
        const unsigned char* next;
        const unsigned char* end;
    };
    /// The bytes that stand next, at least one. False when there are none or they have to go through `get`.
    bool open_run(s_byte_run* run) {
        if (m_run_blocks != 0 || m_previous == '\r' || m_errors.is_fatal_errored()) return false;
        if (m_source.m_run.next == m_source.m_run.end && !refill_run()) return false;
        run->next = m_source.m_run.next;
        run->end = m_source.m_run.end;
        return true;
    }
    /// Consumes the bytes of the open run up to `to`, of which `line_feeds` are line feeds.
    void take_run(const unsigned char* to, unsigned line_feeds = 0) {
        if (to == m_source.m_run.next) return;
        m_previous = to[-1];
        m_source.m_run.next = to;
        m_line += line_feeds;
    }
    /// Tells that the bytes before `to` would have been read and pushed back on the way through `get`. Only a
    /// `rewind` of the source can show the difference.
    void note_look_ahead(const unsigned char* to) {
        if (m_run_mark == nullptr || m_run_mark < to) m_run_mark = to;
    }
    /// Whether a run may hold UTF-8 sequences too. Otherwise a byte from 0x80 ends it.
    bool run_may_hold_utf8() const { return m_encoding == ENCODING_UTF8; }

protected:
    /// Why bytes have to go through `get` one by one; runs are open while there is no reason.
    enum run_block : unsigned {
        block_switched_off = 1,
        block_encoding = 2,
        block_pushed_back = 4,
        block_pending = 8,
        block_entity = 16
    };
    void block_runs(unsigned why, bool on) { m_run_blocks = on ? m_run_blocks | why : m_run_blocks & ~why; }

    /// The next value when it can be had without further thought. Otherwise false: use the long way.
    bool get_plain(int* c) {
        if (m_run_blocks != 0 || m_errors.is_fatal_errored()) return false;
        const unsigned char* const next = m_source.m_run.next;
        if (next == m_source.m_run.end || *next >= 0x80 || *next == '\r' || *next == '\n') return false;
        m_source.m_run.next = next + 1;
        m_previous = *next;
        *c = *next;
        return true;
    }
    int get_normalised();

private:
    bool refill_run();
    bool step_back(int c);
    int read_byte();
    int get_unit();
    int get_wide_unit(int first);
    int join_16_bits(int first, bool big_endian);
    int get_multi_byte(int first);
    void read_multi_byte(int first);
    int get_encoded(int code_point);
    int detect_encoding(int b0);
    int detect_from_byte_order_mark(int b0);
    int refuse_encoding();
    bool refuse_mismatch();
    void set_mode(eqxp_encoding encoding);
    void set_pending(const unsigned char* pending);

    c_read& m_source;
    c_error& m_errors;
    c_getter_error_binder m_binder;
    eqxp_encoding m_encoding = ENCODING_UNKNOWN;
    int m_previous = 0;
    c_unget_buffer m_unget;
    unsigned char m_character[8] = {0};
    const unsigned char* m_pending = nullptr;
    unsigned m_line = 1;
    unsigned m_run_blocks = block_encoding;
    const unsigned char* m_run_mark = nullptr;
};

}  // namespace qbxV2
