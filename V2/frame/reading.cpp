#include "V2/frame/reading.h"

#include <limits>

namespace vrl_v2::frame {

using qbxV2::EQBX_NO_ERROR;

bool reporting::report(eqbx_error code, const std::string& item, int line) {
    const eqbx_error result = m_reader.handle_error(code, item, m_source, line);
    if (result != EQBX_NO_ERROR) stop(result);
    return result == EQBX_NO_ERROR;
}

void attribute_reader::find(const s_event_map* first, const s_event_map* last) {
    m_reader.tokenise(first, last, qbxV2::EQXP_ATTRIBUTE);
    const int event = m_reader.get_current_event();
    if (event < qbxV2::EQXP_FIRST_TOKEN) return;
    for (const s_event_map* row = first; row != last; ++row) {
        if (row->token == event) {
            m_which = static_cast<int>(row - first);
            return;
        }
    }
}

bool attribute_reader::take_value(std::string& text, qbxV2::eqbx_whitespace mode, int line) {
    if (m_reader.get_attribute_value(&text, mode)) return true;
    report(qbxV2::EQBX_ATTRIBUTE_VALUE_UNREADABLE, m_name, line);
    return false;
}

bool attribute_reader::read_nil(bool& nil, int line) {
    std::string& text = m_reader.value_buffer();
    if (!take_value(text, qbxV2::EQBX_WS_COLLAPSE, line)) return !stopped();
    nil = text == "true" || text == "1";
    return true;
}

void children_reader::name_event(names_between names) {
    if (at_element()) m_reader.tokenise(m_rows + names.first, m_rows + names.last, qbxV2::EQXP_ELEMENT);
}

void children_reader::begin(names_between first) {
    m_reader.tokenise(m_rows + first.first, m_rows + first.last, qbxV2::EQXP_ELEMENT);
}

void children_reader::begin_derived(names_between first) { name_event(first); }

void children_reader::advance_to(const s_event_map* first, const s_event_map* last, int line) {
    if (stopped()) return;
    eqbx_error error = EQBX_NO_ERROR;
    m_reader.get_element_event(first, last, &error, m_name);
    if (error != EQBX_NO_ERROR) report(error, *m_name, line);
}

void children_reader::advance(unsigned i, int line) {
    advance_to(m_rows + m_next[i].first, m_rows + m_next[i].last, line);
}

int children_reader::which() const {
    const int event = m_reader.get_current_event();
    if (event < qbxV2::EQXP_FIRST_TOKEN) return -1;
    for (int i = 0; i < m_next[0].last; ++i) {
        if (m_rows[i].token == event) return i;
    }
    return -1;
}

void children_reader::advance_in_choice(int line) { advance_to(m_rows, m_rows + m_next[0].last, line); }

void children_reader::no_option(int line) { report(qbxV2::EQBX_UNKNOWN_ELEMENT, *m_name, line); }

bool children_reader::take_text(qbxV2::eqbx_whitespace mode, eqbx_error* error) {
    bool is_empty = false;
    return m_reader.get_simple_type_value(*m_name, mode, &m_reader.value_buffer(), error, &is_empty);
}

void children_reader::report_missing(unsigned i, int line) {
    report(qbxV2::EQBX_MANDATORY_ELEMENT_MISSING, std::string("Vrl:") + m_rows[i].name, line);
}

bool children_reader::finish_object(eqbx_error result) {
    if (result != EQBX_NO_ERROR) stop(result);
    return result == EQBX_NO_ERROR;
}

bool children_reader::finish_group(bool read) {
    m_stopped = m_stopped || !read;
    return read;
}

void children_reader::lists_filled(bool filled, const char* type_name, int line) {
    if (!stopped() && !filled) report(qbxV2::EQBX_MANDATORY_ELEMENT_MISSING, type_name, line);
}

void any_reader::read(list<qbxV2::c_any_info>& entries, int line) {
    if (!m_reader.is_current_event_tokenisable()) {
        report(qbxV2::EQBX_MANDATORY_ELEMENT_MISSING, "Vrl:", line);
        return;
    }
    while (!stopped() && m_reader.is_current_event_tokenisable()) read_entry(entries.append(), line);
}

void any_reader::read_entry(qbxV2::c_any_info& entry, int line) {
    std::string& text = m_reader.value_buffer();
    std::string ns;
    entry.set_namespace(m_reader.get_namespace(*m_name, &ns));
    entry.set_name(*m_name);
    if (m_reader.get_any_element(*m_name, &text, qbxV2::EQBX_WS_PRESERVE, false)) {
        entry.set_value(text);
    } else if (!report(qbxV2::EQBX_ELEMENT_VALUE_UNREADABLE, *m_name, line)) {
        return;
    }
    eqbx_error error = EQBX_NO_ERROR;
    m_reader.get_element_event(nullptr, &error, m_name);
    if (error != EQBX_NO_ERROR) report(error, *m_name, line);
}

bool text_reader::take_text(std::string& text, qbxV2::eqbx_whitespace mode, bool has_content, int line) {
    text.clear();
    if (!has_content || m_reader.get_element_value(&text, mode, true)) return true;
    report(qbxV2::EQBX_ELEMENT_VALUE_UNREADABLE, m_name, line);
    return false;
}

}  // namespace vrl_v2::frame
