#include "V2/frame/group.h"

namespace vrl_v2::frame {

using qbxV2::c_xml_reader;
using qbxV2::s_event_map;

bool is_group_member(c_xml_reader& reader, const s_event_map* first, const s_event_map* last) {
    if (!reader.is_current_event_tokenisable()) return false;
    const int event = reader.get_current_event();
    reader.tokenise(first, last, qbxV2::EQXP_ELEMENT);
    if (reader.get_current_event() >= qbxV2::EQXP_FIRST_TOKEN) return true;
    reader.restore_event(event);
    return false;
}

int group_reader::which() {
    m_reader.tokenise(m_first, m_last, qbxV2::EQXP_ELEMENT);
    const int event = m_reader.get_current_event();
    if (event < qbxV2::EQXP_FIRST_TOKEN) return -1;
    for (const s_event_map* row = m_first; row != m_last; ++row) {
        if (row->token == event) return static_cast<int>(row - m_first);
    }
    return -1;
}

bool group_reader::skip(int line) {
    if (!m_reader.skip_rest_of_element(*m_name) && !report(qbxV2::EQBX_BAD_END_OF_ELEMENT, *m_name, line)) {
        return false;
    }
    return advance(line);
}

bool group_reader::advance(int line) {
    eqbx_error error = qbxV2::EQBX_NO_ERROR;
    m_reader.get_element_event(m_first, m_last, &error, m_name);
    return error == qbxV2::EQBX_NO_ERROR || report(error, *m_name, line);
}

}  // namespace vrl_v2::frame
