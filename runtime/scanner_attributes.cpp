#include <cstring>

#include "runtime/character_class.h"
#include "runtime/scanner.h"

namespace qbxV2 {
namespace {

constexpr char k_xmlns[] = "xmlns";
constexpr std::size_t k_xmlns_size = sizeof k_xmlns - 1;

/// Whether an attribute's NUL-terminated name is "xmlns" or begins with "xmlns:".
bool is_namespace_declaration(const char* name) {
    return std::strncmp(name, k_xmlns, k_xmlns_size) == 0 &&
           (name[k_xmlns_size] == '\0' || name[k_xmlns_size] == ':');
}

}  // namespace

/// Reads the attributes of a start tag into the two buffers, up to what ends the tag.
bool c_xml::get_attributes(c_xml_local* scope) {
    m_attributes.clear();
    m_ns_attributes.clear();
    for (;;) {
        while (m_getter.take_attribute(&m_attributes.bytes())) {
        }
        const int first = m_getter.get_non_ws();
        if (!detail::is_name_start(first)) {
            m_getter.unget(first);
            m_attributes.bytes().push_back('\0');
            return first != -1;
        }
        std::string& bytes = m_attributes.bytes();
        const std::size_t at = bytes.size();
        bytes.push_back(static_cast<char>(first));
        m_getter.unget(m_getter.get_rest_of_name(&bytes));
        bytes.push_back('\0');
        if (first == 'x' && is_namespace_declaration(bytes.c_str() + at)) {
            if (!get_declaration(scope, at)) return false;
        } else if (!get_raw_value(&bytes)) {
            return false;
        }
    }
}

/// Moves a name that turned out to be a declaration's to the other buffer, and reads and enters the
/// declaration.
bool c_xml::get_declaration(c_xml_local* scope, std::size_t at) {
    std::string& bytes = m_ns_attributes.bytes();
    const std::size_t name_at = bytes.size();
    bytes.append(m_attributes.bytes(), at, std::string::npos);
    m_attributes.bytes().resize(at);
    const std::size_t quote_at = bytes.size();
    if (!get_raw_value(&bytes)) return false;
    return declare_namespace(scope, bytes.c_str() + name_at, bytes.c_str() + quote_at + 1);
}

/// Reads `="value"`: appends the opening quote, the value as it stands, and a NUL.
bool c_xml::get_raw_value(std::string* bytes) {
    const int equals = m_getter.get_non_ws();
    if (equals == -1) {
        m_getter.error(EQBX_ET_FATAL, EQBX_UNEXPECTED_END, "Unexpected end of file");
        return false;
    }
    if (equals != '=') {
        m_getter.error(
            EQBX_ET_FATAL, EQBX_NOT_WELL_FORMED,
            std::string("Schema is not Well Formed (expected '=', got '") + static_cast<char>(equals) + "')");
        return false;
    }
    int c = m_getter.get_non_ws();
    if (c == '"' || c == '\'') {
        bytes->push_back(static_cast<char>(c));
        if (m_getter.get_up_to_quote(c, bytes)) {
            bytes->push_back('\0');
            return true;
        }
        c = -1;
    }
    m_getter.error(
        EQBX_ET_FATAL, EQBX_NOT_WELL_FORMED,
        std::string("Schema is not Well Formed (expected '\"' or ''', got ") + static_cast<char>(c) + ")");
    return false;
}

bool c_xml::declare_namespace(c_xml_local* scope, const char* name, const char* value) {
    const char* const prefix = name[k_xmlns_size] == ':' ? name + k_xmlns_size + 1 : "";
    if (std::strchr(value, '&') != nullptr) {
        if (!expand_declared_uri(value)) return false;
        value = m_scratch.c_str();
    }
    // Intended: only the default namespace can be undeclared. For a prefix the empty text is a URI like any
    // other.
    const bool undeclares = *prefix == '\0' && *value == '\0';
    scope->add_namespace(prefix,
                         undeclares ? static_cast<int>(k_ns_none) : m_namespaces.add_namespace(value));
    return true;
}

bool c_xml::expand_declared_uri(const char* value) {
    m_scratch.clear();
    std::size_t at = 0;
    c_entity_name_reader_for_c_str reader(value, &at);
    while (value[at] != '\0') {
        const char c = value[at++];
        if (c != '&') {
            m_scratch.push_back(c);
        } else if (!expand_reference(reader, &m_scratch)) {
            return false;
        }
    }
    return true;
}

eqxp_xml_event c_xml::get_attribute_name(std::string* name, bool in_pi) {
    name->clear();
    // A fatal report ends what was read ahead, too.
    if (!m_attributes.is_used_up() && !m_getter.get_error_handler().is_fatal_errored()) {
        const std::size_t at = m_attributes.position();
        const std::size_t behind = m_attributes.behind_text(at);
        name->assign(m_attributes.text_at(at), behind - at - 1);
        m_attributes.set_position(behind);
        return EQXP_NAME;
    }
    const int c = m_getter.get_non_ws();
    m_tag_is_cut = c < 0;
    if (c == '>') return EQXP_START_TAG_END;
    if (c == (in_pi ? '?' : '/') && m_getter.get_non_ws() == '>') return EQXP_END_TAG;
    return fail_not_well_formed("XML not well-formed");
}

bool c_xml::get_attribute_value(std::string* value, eqbx_whitespace mode) {
    value->clear();
    m_getter.set_ws_mode(mode);
    m_attributes.advance();
    c_entity_name_reader_for_attribute_data reader(m_attributes);
    for (;;) {
        const char* const from = m_attributes.text_at(m_attributes.position());
        const char* to = from;
        while (*to != '\0' && *to != '&') ++to;
        m_getter.add_chars_wsp(value, from, to);
        m_attributes.set_position(m_attributes.position() + static_cast<std::size_t>(to - from));
        const char stop = *to;
        m_attributes.advance();
        if (stop == '\0') return true;
        if (!expand_reference(reader, value)) {
            // Whoever goes on finds the next attribute, not the rest of this value as one.
            m_attributes.set_position(m_attributes.behind_text(m_attributes.position()));
            return false;
        }
    }
}

bool c_xml::skip_attribute_value() {
    m_attributes.advance();
    m_attributes.set_position(m_attributes.behind_text(m_attributes.position()));
    return true;
}

bool c_xml::get_named_attribute(const c_xml_local* scope, int ns_id, const std::string& local_name,
                                std::string* value) {
    bool found = false;
    while (!found && !m_attributes.is_used_up()) {
        const std::size_t at = m_attributes.position();
        const char* const name = m_attributes.text_at(at);
        m_attributes.set_position(m_attributes.behind_text(at));
        const char* const colon = std::strchr(name, ':');
        // Intended: without a prefix an attribute takes the default namespace here.
        const std::size_t prefix_size = colon != nullptr ? static_cast<std::size_t>(colon - name) : 0;
        found = local_name == (colon != nullptr ? colon + 1 : name) &&
                scope->find_namespace_id(name, prefix_size) == ns_id;
        if (!found) skip_attribute_value();
    }
    if (found) get_attribute_value(value, EQBX_WS_PRESERVE);
    m_attributes.set_position(0);
    return found;
}

bool c_xml::get_xsi_type(const c_xml_local* scope, int* ns_id, std::string* type_name) {
    if (!get_named_attribute(scope, k_ns_xsi, "type", type_name)) return false;
    *ns_id = get_ns_id(scope, *type_name);
    if (*ns_id == k_ns_not_found && type_name->find(':') == std::string::npos) *ns_id = k_ns_none;
    get_local_name(*type_name, type_name);
    return true;
}

bool c_xml::is_xsi_attribute(const c_xml_local* scope, const std::string& qname) const {
    return get_ns_id(scope, qname) == k_ns_xsi;
}

}  // namespace qbxV2
