#include "runtime/dtd.h"

#include "runtime/character_class.h"
#include "runtime/references.h"

namespace qbxV2 {

using detail::is_space;

bool c_dtd_util::select_parameter_entity() {
    const c_get_with_entities::c_reference reference(m_getter);
    c_entity_name_reader_for_c_get reader(m_getter, false);
    std::string name;
    detail::read_reference_name(reader, reader.get(), &name);
    const char* value = nullptr;
    if (m_getter.get_parameter_entity(name.c_str(), &value)) return m_getter.set_input_entity_value(value);
    m_getter.error(EQBX_ET_ERROR, EQBX_ENTITY_NOT_FOUND, "Entity '%" + name + "' not found");
    return true;
}

bool c_dtd_util::get_entity_value(std::string* out) {
    int c = m_getter.get_non_ws();
    if (c == -1) return false;
    for (; c != -1 && c != '>' && !is_space(c); c = get()) {
        if (c != '%') {
            out->push_back(static_cast<char>(c));
        } else if (!select_parameter_entity()) {
            return false;
        }
    }
    unget(c);
    return true;
}

bool c_dtd_util::get_quoted_entity_value(std::string* out) {
    const int quote = m_getter.get_non_ws();
    if (quote != '"' && quote != '\'') return false;
    out->clear();
    const std::size_t depth = m_getter.get_entity_stack_depth();
    for (;;) {
        int c = get();
        // A quote from within a parameter entity's text is no delimiter: XML 1.0, 4.4.5 Included in Literal.
        if (c == -1 || (c == quote && m_getter.get_entity_stack_depth() == depth)) return true;
        if (c == '%') {
            if (!select_parameter_entity()) return false;
            continue;
        }
        if (c == '&') {
            // Character references are resolved now, references to general entities when the entity is used.
            c = get();
            if (c == '#') {
                c_entity_name_reader_for_c_get reader(m_getter, false);
                if (!m_getter.insert_character_entity(reader, out)) return false;
                continue;
            }
            out->push_back('&');
            if (c == -1) return true;
        }
        out->push_back(static_cast<char>(c));
    }
}

bool c_internal_dtd::read_doctype_decl() {
    for (int c = 0; c != '[';) {
        c = m_getter.get();
        if (c == -1) return false;
        if (c == '>') return true;
    }
    c_dtd_util util(m_getter);
    for (;;) {
        const int c = m_getter.get_non_ws();
        switch (c) {
            case '<':
                if (!read_markup()) return false;
                break;
            case ']':
                return read_end_of_subset();
            case '%':
                if (!util.select_parameter_entity()) return false;
                break;
            default:
                return refuse("DTD not Well Formed (got ", c);
        }
    }
}

bool c_internal_dtd::refuse(const char* text, int c) {
    m_getter.error(EQBX_ET_FATAL, EQBX_BAD_DTD, std::string(text) + static_cast<char>(c) + ")");
    return false;
}

bool c_internal_dtd::read_end_of_subset() {
    const int c = m_getter.get_non_ws();
    return c == '>' || refuse("DTD not Well Formed (expected '>', got ", c);
}

bool c_internal_dtd::read_markup() {
    std::string word;
    while (word != "!--") {
        const int c = m_getter.get();
        if (c == -1 || c == '[' || c == '>' || is_space(c)) {
            m_getter.unget(c);
            break;
        }
        word.push_back(static_cast<char>(c));
    }
    if (word == "!--") return m_getter.skip_comment();
    if (word == "!ENTITY") return read_entity_declaration();
    if (!word.empty() && word[0] == '?') return m_getter.skip_PI();
    skip_declaration();
    return true;
}

/// Passes over everything up to the next ">" outside quotes.
void c_internal_dtd::skip_declaration() {
    int quote = 0;
    for (;;) {
        const int c = m_getter.get();
        if (c == -1) return;
        if (quote != 0) {
            if (c == quote) quote = 0;
        } else if (c == '"' || c == '\'') {
            quote = c;
        } else if (c == '>') {
            return;
        }
    }
}

bool c_internal_dtd::read_entity_declaration() {
    const bool good = read_entity_definition();
    skip_declaration();
    return good;
}

bool c_internal_dtd::read_entity_definition() {
    c_dtd_util util(m_getter);
    const int first = m_getter.get_non_ws();
    const bool is_parameter = first == '%';
    if (!is_parameter) m_getter.unget(first);
    std::string name;
    if (!util.get_entity_value(&name)) return false;
    const int c = m_getter.get_non_ws();
    m_getter.unget(c);
    std::string value;
    if (c == '"' || c == '\'' ? !util.get_quoted_entity_value(&value)
                              : !read_external_definition(util, &value)) {
        return false;
    }
    if (is_parameter) {
        m_getter.add_parameter_entity(name.c_str(), value.c_str());
    } else {
        m_getter.add_general_entity(name.c_str(), value.c_str());
    }
    return true;
}

/// Intended: an external entity is defined with the keyword as its value, so that the document can still be
/// read.
bool c_internal_dtd::read_external_definition(c_dtd_util& util, std::string* keyword) {
    if (!util.get_entity_value(keyword)) return false;
    if (*keyword == "SYSTEM" || *keyword == "PUBLIC") {
        m_getter.error(EQBX_ET_WARNING, EQBX_EXTERNAL_ENTITY, "External Entity definitions not supported");
    } else {
        m_getter.error(EQBX_ET_ERROR, EQBX_UNEXPECTED_ENTITY,
                       "Unexpected value in Entity definition: " + *keyword);
    }
    return true;
}

}  // namespace qbxV2
