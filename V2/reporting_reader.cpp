#include "V2/reporting_reader.h"

#include "V2/report_message.h"

namespace vrl_v2 {

using qbxV2::eqbx_error;

reporting_reader::reporting_reader(document_source& source, const load_options& options)
    : c_xml_reader(source), m_source(source), m_options(options) {
    set_max_depth(options.max_depth);
    set_max_entity_expansion(options.max_entity_expansion);
}

eqbx_error reporting_reader::user_handle_error(eqbx_error code, const std::string& item, const char* /*file*/,
                                               int /*line*/) {
    load_report report;
    report.code = code;
    report.line = get_line_no();
    report.item = item;
    report.message = exceeded_limit(code);
    if (report.message.empty()) {
        report.message = report_message(*this, get_element_name_stack(), value_buffer(), code, item);
    } else if (m_reports.empty()) {
        m_limit_exceeded = true;
    }
    m_reports.push_back(report);
    if (!can_go_on(code)) return code;
    const bool at_surplus_content =
        code == qbxV2::EQBX_BAD_END_OF_ELEMENT && is_at_content() && is_within(item);
    return !at_surplus_content || skip_to_end_of_element() ? qbxV2::EQBX_NO_ERROR : code;
}

/// In words; empty when it is none.
std::string reporting_reader::exceeded_limit(eqbx_error code) {
    if (code == qbxV2::EQBX_BADLY_FORMED && depth() > get_max_depth())
        return "elements are nested more than " + std::to_string(get_max_depth()) + " deep";
    if (has_exceeded_entity_expansion())
        return "entities expand to more than " + std::to_string(m_options.max_entity_expansion) + " bytes";
    return {};
}

bool reporting_reader::can_go_on(eqbx_error code) const {
    if (!m_options.collect_reports || m_reports.size() >= m_options.max_reports) return false;
    if (!m_source.problem() || code == qbxV2::EQBX_ELEMENT_NOT_FOUND) return false;
    const int event = get_current_event();
    if (is_error_event(event) || event == qbxV2::EQXP_END_OF_MESSAGE) return false;
    qbxV2::eqbx_error_type type = qbxV2::EQBX_ET_NONE;
    eqbx_error noted = qbxV2::EQBX_NO_ERROR;
    int line = 0;
    return !get_error_info(&type, &noted, &line) || type != qbxV2::EQBX_ET_FATAL;
}

bool reporting_reader::is_at_content() const {
    return is_current_event_tokenisable() || get_current_event() == qbxV2::EQXP_TEXT;
}

/// Whether the innermost open element is this one. (For an element of simple type it is the one around it.)
bool reporting_reader::is_within(const std::string& element) {
    const qbxV2::c_string_stack& open = get_element_name_stack();
    const std::size_t size = open.get_stack_size();
    if (size <= element.size()) return false;
    const std::size_t at = size - element.size() - 1;
    return (at == 0 || *open.at(at - 1) == '\0') && open.equals(at, element);
}

bool reporting_reader::skip_to_end_of_element() {
    std::string& name = element_name_buffer();
    while (is_at_content()) {
        if (is_current_event_tokenisable() && !skip_rest_of_element(name)) return false;
        eqbx_error error = qbxV2::EQBX_NO_ERROR;
        get_element_event(nullptr, &error, &name);
        if (error != qbxV2::EQBX_NO_ERROR) return false;
    }
    return get_current_event() == qbxV2::EQXP_END_TAG;
}

void reporting_reader::note(eqbx_error code) { user_handle_error(code, get_full_name(), nullptr, 0); }

}  // namespace vrl_v2
