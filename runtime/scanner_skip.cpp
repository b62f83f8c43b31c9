#include "runtime/open_elements.h"
#include "runtime/scanner.h"

namespace qbxV2 {

bool c_xml::skip_rest_of_element(const std::string& name) {
    bool is_empty = false;
    return m_getter.move_to_start_tag_end(&is_empty) && (is_empty || skip_element_body(name));
}

bool c_xml::skip_rest_of_empty_element(const std::string& name) {
    bool is_empty = false;
    return m_getter.move_to_start_tag_end(&is_empty) && (is_empty || is_element_end_tag(name));
}

bool c_xml::skip_element_body(const std::string& name) {
    detail::c_open_elements open;
    open.push(name);
    c_xml_local scope;
    std::string found;
    while (!open.empty()) {
        scope.clear();
        switch (get_element_name(&scope, &found)) {
            case EQXP_TEXT:
                break;
            case EQXP_NAME: {
                bool is_empty = false;
                if (!m_getter.move_to_start_tag_end(&is_empty)) return false;
                if (!is_empty) open.push(found);
                break;
            }
            case EQXP_END_TAG:
                if (!open.top_is(found)) {
                    m_getter.error(
                        EQBX_ET_ERROR, EQBX_NOT_WELL_FORMED,
                        "Element start tag (" + open.top() + ") and end tag (" + found + ") do not match");
                    return false;
                }
                open.pop();
                break;
            default:
                return false;
        }
    }
    return true;
}

}  // namespace qbxV2
