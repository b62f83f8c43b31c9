#include "runtime/scanner.h"

#include "runtime/character_class.h"

namespace qbxV2 {

c_xml::c_xml(c_read& source, c_error& errors, bool ws_for_char_refs)
    : m_getter(source, errors, ws_for_char_refs), m_dtd(m_getter) {}

void c_xml::add_general_entity(const std::string& name, const std::string& value) {
    m_getter.add_general_entity(name.c_str(), value.c_str());
}

void c_xml::add_parameter_entity(const std::string& name, const std::string& value) {
    m_getter.add_parameter_entity(name.c_str(), value.c_str());
}

void c_xml::rewind() {
    m_namespaces.clear();
    m_doctype_read = false;
    m_first_event_delivered = false;
    m_getter.rewind();
}

int c_xml::get_ns_id(const c_xml_local* scope, const std::string& qname) const {
    const std::size_t colon = qname.find(':');
    return scope->find_namespace_id(qname.data(), colon == std::string::npos ? 0 : colon);
}

std::string& c_xml::get_namespace_prefix(const std::string& name, std::string* out) {
    const std::size_t colon = name.find(':');
    if (colon == std::string::npos) {
        out->clear();
    } else {
        out->assign(name, 0, colon);
    }
    return *out;
}

std::string& c_xml::get_local_name(const std::string& name, std::string* out) {
    const std::size_t colon = name.find(':');
    return out->assign(name, colon == std::string::npos ? 0 : colon + 1, std::string::npos);
}

eqxp_xml_event c_xml::deliver(eqxp_xml_event event) {
    m_first_event_delivered = true;
    return event;
}

eqxp_xml_event c_xml::fail_not_well_formed(const char* message) {
    m_getter.error(EQBX_ET_ERROR, EQBX_NOT_WELL_FORMED, message);
    return EQXP_ERROR;
}

eqxp_xml_event c_xml::get_element_name(c_xml_local* scope, std::string* name) {
    for (;;) {
        name->clear();
        const int c = m_getter.get_non_ws();
        if (c == -1) return deliver(EQXP_END_OF_MESSAGE);
        eqxp_xml_event event = EQXP_ERROR;
        const step result = c == '<' ? get_tag_or_markup(scope, name, &event) : get_text(c, name, &event);
        if (result == step::deliver) return deliver(event);
        if (result == step::fail) return EQXP_ERROR;
    }
}

c_xml::step c_xml::get_tag_or_markup(c_xml_local* scope, std::string* name, eqxp_xml_event* event) {
    if (m_getter.take_name(name)) return get_tag_attributes(scope, event);
    const int c = m_getter.get();
    if (detail::is_name_start(c)) return get_start_tag(c, scope, name, event);
    switch (c) {
        case '/':
            return get_end_tag(name, event);
        case '?':
            return get_instruction();
        case '!':
            return get_markup(name, event);
        default:
            fail_not_well_formed("XML not Well-Formed");
            m_getter.move_to_start_tag_end(nullptr);
            return step::fail;
    }
}

c_xml::step c_xml::get_start_tag(int first, c_xml_local* scope, std::string* name, eqxp_xml_event* event) {
    name->push_back(static_cast<char>(first));
    const int c = m_getter.get_rest_of_name(name);
    if (c == -1) {
        fail_not_well_formed("XML not Well-Formed");
        return step::fail;
    }
    m_getter.unget(c);
    return get_tag_attributes(scope, event);
}

c_xml::step c_xml::get_tag_attributes(c_xml_local* scope, eqxp_xml_event* event) {
    if (!get_attributes(scope)) return step::fail;
    *event = EQXP_NAME;
    return step::deliver;
}

c_xml::step c_xml::get_end_tag(std::string* name, eqxp_xml_event* event) {
    int c = m_getter.take_name(name) ? m_getter.get() : m_getter.get_rest_of_name(name);
    if (name->empty()) return step::fail;
    if (detail::is_space(c)) c = m_getter.get_non_ws();
    if (c != '>') {
        fail_not_well_formed("XML not Well-Formed");
        return step::fail;
    }
    *event = EQXP_END_TAG;
    return step::deliver;
}

/// From behind "<?". Every target that begins with "xml" counts as the XML declaration.
c_xml::step c_xml::get_instruction() {
    if (!m_getter.read_specified_string_from_input("xml")) {
        return m_getter.skip_PI() ? step::again : step::fail;
    }
    if (m_first_event_delivered) {
        m_getter.error(EQBX_ET_FATAL, EQBX_BAD_XML_DECL, "XML declaration not at start of document");
        return step::fail;
    }
    return m_getter.read_xml_decl() ? step::again : step::fail;
}

/// From behind "<!".
c_xml::step c_xml::get_markup(std::string* name, eqxp_xml_event* event) {
    *event = EQXP_ERROR;
    const int c = m_getter.get();
    if (c == '[') {
        name->clear();
        if (m_getter.get_cdata(name)) {
            *event = EQXP_TEXT;
        } else {
            fail_not_well_formed("XML not Well-Formed");
        }
        return step::deliver;
    }
    if (c == '-' && m_getter.read_specified_string_from_input("-")) {
        return m_getter.skip_comment() ? step::again : step::deliver;
    }
    if (c == 'D' && m_getter.read_specified_string_from_input("OCTYPE")) return get_doctype();
    // Intended: no report for other markup.
    m_getter.move_to_start_tag_end(nullptr);
    return step::deliver;
}

c_xml::step c_xml::get_doctype() {
    if (m_first_event_delivered) {
        m_getter.error(EQBX_ET_ERROR, EQBX_BAD_DTD, "Document Type Declaration not at start of document");
        return step::deliver;
    }
    if (m_doctype_read) {
        m_getter.error(EQBX_ET_ERROR, EQBX_BAD_DTD, "Document Type Declaration already read");
        return step::deliver;
    }
    if (!m_dtd.read_doctype_decl()) return step::deliver;
    m_doctype_read = true;
    return step::again;
}

/// Character data that begins with `c`.
c_xml::step c_xml::get_text(int c, std::string* text, eqxp_xml_event* event) {
    if (c != '&') {
        text->push_back(static_cast<char>(c));
    } else {
        c_entity_name_reader_for_c_get reader(m_getter, true);
        if (!expand_reference(reader, text)) return step::fail;
        // Nothing came out: the text of the entity is the next input.
        if (text->empty()) return step::again;
    }
    if (!get_rest_of_text(text)) return step::fail;
    *event = EQXP_TEXT;
    return step::deliver;
}

bool c_xml::get_rest_of_text(std::string* text) {
    m_getter.reset_ws_mode();
    c_entity_name_reader_for_c_get reader(m_getter, true);
    for (;;) {
        m_getter.add_text_run(text, true);
        const int c = m_getter.get();
        if (c == '<' || c == -1) {
            m_getter.unget(c);
            return true;
        }
        if (c != '&') {
            m_getter.add_char_wsp(text, c, false);
        } else if (!expand_reference(reader, text)) {
            return false;
        }
    }
}

bool c_xml::get_element_value(std::string* value, eqbx_whitespace mode, bool expand_entities) {
    value->clear();
    m_getter.set_ws_mode(mode);
    for (;;) {
        m_getter.add_text_run(value, expand_entities);
        if (m_getter.is_at_tag()) return true;
        const int c = m_getter.get();
        if (c == '<') {
            bool at_tag = false;
            if (!get_value_markup(value, &at_tag)) return false;
            if (at_tag) return true;
        } else if (c == '&' && expand_entities) {
            c_entity_name_reader_for_c_get reader(m_getter, true);
            if (!expand_reference(reader, value)) return false;
        } else if (c == -1) {
            m_getter.error(EQBX_ET_ERROR, EQBX_UNEXPECTED_END, "Premature end of file encountered");
            return false;
        } else {
            m_getter.add_char_wsp(value, c, false);
        }
    }
}

/// From behind a "<" within a value: passes over what belongs to the value; a tag is pushed back.
bool c_xml::get_value_markup(std::string* value, bool* at_tag) {
    const int c = m_getter.get();
    if (c == '?') {
        m_getter.skip_PI();
        return true;
    }
    if (c != '!') {
        m_getter.unget(c);
        m_getter.unget('<');
        *at_tag = true;
        return true;
    }
    const int kind = m_getter.get();
    if (kind == '-' && m_getter.get() == '-') {
        m_getter.skip_comment();
        return true;
    }
    if (kind == '[' && m_getter.get_cdata(value)) return true;
    fail_not_well_formed("XML not well-formed");
    return false;
}

}  // namespace qbxV2
