#pragma once

#include <string>

#include "platform/api.h"
#include "runtime/error_codes.h"

/// Failures travel as result codes; nothing in the library throws the exception classes below.
#define QBX_USE_EXCEPTIONS 0

namespace qbxV2 {

class c_get_as_utf8;
class c_getter_error_binder;

/// The record that the scanner writes its reports to: counts by severity, and the latest report.
///
/// A later report overwrites an earlier one of any severity, until a fatal one freezes the record for good.
/// Copies copy all fields, the current getter included. Owns nothing. One thread at a time.
class VRL_API c_error {
public:
    c_error() = default;
    c_error(const c_error&) = default;
    c_error& operator=(const c_error&) = default;

    /// Sees each report that is recorded. Does nothing by default: the message texts of the scanner reach
    /// only a subclass. `source_id` and `message` live for the call only; `source_id` can be null.
    virtual void report_error(eqbx_error_type type, eqbx_error code, const char* source_id, int line,
                              const char* message);
    virtual ~c_error();

    /// Records a report with source name and line of the current getter; null and -1 when there is none.
    void error(eqbx_error_type type, eqbx_error code, const char* message);
    /// Records a report and hands it to `report_error`. Ignored after a fatal one.
    void error(eqbx_error_type type, eqbx_error code, const char* source_id, int line, const char* message);

    bool is_errored() const { return m_fatal_count + m_error_count != 0; }
    bool is_fatal_errored() const { return m_fatal_count != 0; }
    eqbx_error get_last_error() const { return m_last_error; }
    eqbx_error_type get_last_error_type() const { return m_last_error_type; }
    /// Fills its arguments from the latest report. False, and nothing written, when there was none.
    bool get_error_info(eqbx_error_type* type, eqbx_error* code, int* line) const;

    /// Makes the binder's new getter current and returns the one that was.
    const c_get_as_utf8* register_getter(c_getter_error_binder* binder);
    /// Makes the binder's old getter current again.
    void unregister_getter(c_getter_error_binder* binder);

private:
    const c_get_as_utf8* m_current_getter = nullptr;
    int m_fatal_count = 0;
    int m_error_count = 0;
    int m_warning_count = 0;
    int m_note_count = 0;
    eqbx_error_type m_last_error_type = EQBX_ET_NONE;
    eqbx_error m_last_error = EQBX_NO_ERROR;
    int m_last_error_line = -1;
};

/// Scope guard that a getter holds: names the getter in reports while it lives. Getters nest like a stack.
class VRL_API c_getter_error_binder {
public:
    explicit c_getter_error_binder(c_error& errors) : m_errors(errors) {}
    c_getter_error_binder(const c_getter_error_binder&) = delete;
    c_getter_error_binder& operator=(const c_getter_error_binder&) = delete;
    ~c_getter_error_binder();

    /// Makes `getter` current. Does nothing when already bound.
    void bind(const c_get_as_utf8* getter);
    const c_get_as_utf8* get_new_getter() const { return m_new_getter; }
    const c_get_as_utf8* get_old_getter() const { return m_old_getter; }

private:
    bool m_bound = false;
    c_error& m_errors;
    const c_get_as_utf8* m_new_getter = nullptr;
    const c_get_as_utf8* m_old_getter = nullptr;
};

/// An `eqbx_error` as something to throw, for callers who like that. Derives from no standard exception.
class VRL_API c_qbx_exception {
public:
    explicit c_qbx_exception(eqbx_error code) : m_code(code) {}
    c_qbx_exception(const c_qbx_exception&) = default;
    c_qbx_exception& operator=(const c_qbx_exception&) = default;
    virtual ~c_qbx_exception();
    /// The text of the code, as `get_error_description` gives it.
    virtual const char* what() const;
    eqbx_error get_error() const { return m_code; }

private:
    eqbx_error m_code;
};

/// The same with a line of the input.
class VRL_API c_qbx_reader_exception : public c_qbx_exception {
public:
    c_qbx_reader_exception(eqbx_error code, int line) : c_qbx_exception(code), m_line(line) {}
    c_qbx_reader_exception(const c_qbx_reader_exception&) = default;
    c_qbx_reader_exception& operator=(const c_qbx_reader_exception&) = default;
    ~c_qbx_reader_exception() override;
    int get_line() const { return m_line; }

private:
    int m_line;
};

}  // namespace qbxV2
