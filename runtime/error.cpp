#include "runtime/error.h"

#include "runtime/utf8_decoder.h"

namespace qbxV2 {

c_error::~c_error() = default;

void c_error::report_error(eqbx_error_type, eqbx_error, const char*, int, const char*) {}

void c_error::error(eqbx_error_type type, eqbx_error code, const char* message) {
    if (m_current_getter == nullptr) {
        error(type, code, nullptr, -1, message);
    } else {
        error(type, code, m_current_getter->get_source_id(), m_current_getter->get_line_num(), message);
    }
}

void c_error::error(eqbx_error_type type, eqbx_error code, const char* source_id, int line,
                    const char* message) {
    if (m_fatal_count > 0) return;
    m_last_error_type = type;
    m_last_error_line = line;
    m_last_error = code;
    switch (type) {
        case EQBX_ET_FATAL:
            ++m_fatal_count;
            ++m_error_count;
            break;
        case EQBX_ET_ERROR:
            ++m_error_count;
            break;
        case EQBX_ET_WARNING:
            ++m_warning_count;
            break;
        case EQBX_ET_NOTE:
            ++m_warning_count;
            ++m_note_count;
            break;
        case EQBX_ET_NONE:
        default:
            break;
    }
    report_error(type, code, source_id, line, message);
}

bool c_error::get_error_info(eqbx_error_type* type, eqbx_error* code, int* line) const {
    if (m_last_error == EQBX_NO_ERROR) return false;
    *type = m_last_error_type;
    *code = m_last_error;
    *line = m_last_error_line;
    return true;
}

const c_get_as_utf8* c_error::register_getter(c_getter_error_binder* binder) {
    const c_get_as_utf8* const previous = m_current_getter;
    m_current_getter = binder->get_new_getter();
    return previous;
}

void c_error::unregister_getter(c_getter_error_binder* binder) {
    m_current_getter = binder->get_old_getter();
}

c_getter_error_binder::~c_getter_error_binder() {
    if (m_bound) m_errors.unregister_getter(this);
}

void c_getter_error_binder::bind(const c_get_as_utf8* getter) {
    if (m_bound) return;
    m_new_getter = getter;
    m_old_getter = m_errors.register_getter(this);
    m_bound = true;
}

c_qbx_exception::~c_qbx_exception() = default;

const char* c_qbx_exception::what() const { return get_error_description(m_code); }

c_qbx_reader_exception::~c_qbx_reader_exception() = default;

}  // namespace qbxV2
