#include "runtime/reader.h"

#include <cstdio>
#include <cstring>

#include "runtime/character_class.h"

namespace qbxV2 {
namespace {

template <class Row>
const Row* end_of_table(const Row* first) {
    while (first->name != nullptr) ++first;
    return first;
}

template <class Row>
bool matches(const Row& row, int id, const char* name, std::size_t size) {
    return row.ns_id == id && row.name_length == size && row.name[0] == name[0] &&
           std::memcmp(row.name, name, size) == 0;
}

/// XML Namespaces, production 4 NCName, of ASCII only. Intended: a colon may come first.
bool is_ascii_ncname(const char* name, std::size_t size) {
    const auto byte_passes = [](char c, unsigned mask) {
        return static_cast<unsigned char>(c) < 0x80 && detail::value_is(c, mask);
    };
    if (size == 0 || !byte_passes(name[0], detail::cc_name_start)) return false;
    for (std::size_t i = 1; i < size; ++i) {
        if (name[i] == ':' || !byte_passes(name[i], detail::cc_name)) return false;
    }
    return true;
}

}  // namespace

const std::string c_xml_reader::k_namespace_not_found = " ";

c_xml_reader_local::c_xml_reader_local(c_xml_reader& reader)
    : c_xml_local(*reader.get_reader_local()), m_previous(reader.get_reader_local()), m_reader(&reader) {
    reader.set_reader_local(this);
}

c_xml_reader_local::~c_xml_reader_local() {
    if (m_previous != nullptr) m_reader->set_reader_local(m_previous);
}

c_xml_reader::c_xml_reader(c_read& source) : c_xml(source, m_errors, true), m_scope(&m_root_scope) {
    m_root_scope.set_reader(this);
}

c_xml_reader::~c_xml_reader() = default;

eqbx_error c_xml_reader::user_handle_error(eqbx_error code, const std::string&, const char*, int) {
    return user_handle_error(code);
}

eqbx_error c_xml_reader::user_handle_error(eqbx_error code) { return code; }

eqbx_error c_xml_reader::handle_error(eqbx_error code, const std::string& item_name, const char* source_file,
                                      int source_line) {
    m_error = code;
    // Intended: the reader's own item name, handed back in, comes out empty.
    if (&item_name == &m_error_item_name) {
        m_error_item_name.clear();
    } else {
        m_error_item_name = item_name;
    }
    m_error = user_handle_error(code, item_name, source_file, source_line);
    return m_error;
}

std::string& c_xml_reader::get_error_message(std::string* message) const {
    if (m_error == EQBX_NO_ERROR) return *message = get_error_description(EQBX_NO_ERROR);
    const std::string text = "line:" + std::to_string(get_line_no()) + "-'" + m_error_item_name + "'-" +
                             get_error_description(m_error);
    return *message = text;
}

void c_xml_reader::next_element(eqbx_error* error, std::string* name) {
    m_scope->clear();
    m_event = get_element_name(m_scope, name);
    if (m_event == EQXP_NAME) {
        crack_name(*name);
    } else if (is_error_event(m_event)) {
        *error = m_errors.get_last_error();
    } else if (m_event == EQXP_END_OF_MESSAGE) {
        *error = EQBX_UNEXPECTED_END;
    }
}

void c_xml_reader::get_element_event(const s_event_map map[], eqbx_error* error, std::string* name) {
    next_element(error, name);
    if (m_event == EQXP_NAME && map != nullptr) tokenise(map, EQXP_ELEMENT);
}

void c_xml_reader::get_element_event(const s_event_map* first, const s_event_map* last, eqbx_error* error,
                                     std::string* name) {
    next_element(error, name);
    if (m_event == EQXP_NAME) tokenise(first, last, EQXP_ELEMENT);
}

bool c_xml_reader::take_end_event(const std::string& name) {
    if (!take_end_tag(name)) return false;
    m_scope->clear();
    m_event = EQXP_END_TAG;
    return true;
}

bool c_xml_reader::get_attribute_event(const s_event_map map[], eqbx_error* error, std::string* name) {
    *error = EQBX_NO_ERROR;
    m_event = get_attribute_name(name, false);
    if (m_event == EQXP_NAME) {
        crack_name(*name);
        if (map != nullptr) tokenise(map, EQXP_ATTRIBUTE);
        return true;
    }
    if (is_error_event(m_event)) {
        *error = m_errors.get_last_error();
        return true;
    }
    if (m_event == EQXP_END_OF_MESSAGE) {
        *error = EQBX_UNEXPECTED_END;
        return true;
    }
    return false;
}

void c_xml_reader::get_known_element_event(const s_event_map map[], eqbx_error* error, std::string* name) {
    for (;;) {
        get_element_event(map, error, name);
        const bool is_unclaimed_name = m_event == EQXP_UNKNOWN_ITEM || m_event == EQXP_NAME;
        if (!is_unclaimed_name || is_known_element()) return;
        if (!skip_rest_of_element(*name)) {
            *error = EQBX_BADLY_FORMED;
            return;
        }
    }
}

bool c_xml_reader::is_known_element() const {
    if (m_known_elements == nullptr) return false;
    const int id = name_id(EQXP_ELEMENT);
    for (const s_known_elements* row = m_known_elements; row->name != nullptr; ++row) {
        if (matches(*row, id, m_name.local_name_data(), m_name.local_name_size())) return true;
    }
    return false;
}

int c_xml_reader::name_id(eqxp_attr_elem kind) const {
    if (kind == EQXP_ATTRIBUTE && !m_name.get_has_ns_prefix()) return k_ns_none;
    return m_name.get_element_ns_id();
}

void c_xml_reader::tokenise(const s_event_map map[], eqxp_attr_elem kind) {
    tokenise(map, end_of_table(map), kind);
}

void c_xml_reader::tokenise(const s_event_map* first, const s_event_map* last, eqxp_attr_elem kind) {
    const int id = name_id(kind);
    if (id == k_ns_xsi) {
        tokenise_xsi();
        return;
    }
    const char* const name = m_name.local_name_data();
    const std::size_t size = m_name.local_name_size();
    for (const s_event_map* row = first; row != last; ++row) {
        if (matches(*row, id, name, size)) {
            m_event = row->token;
            return;
        }
    }
    m_event = EQXP_UNKNOWN_ITEM;
}

/// XML Schema Part 1, 2.6 Schema-Related Markup in Documents Being Validated.
void c_xml_reader::tokenise_xsi() {
    const std::string& name = m_name.get_local_name();
    if (name == "type") {
        m_event = EQXP_XSI_TYPE;
    } else if (name == "nil") {
        m_event = EQXP_XSI_NIL;
    } else if (name == "noNamespaceSchemaLocation") {
        m_event = EQXP_XSI_NO_NAMESPACE_SCHEMA_LOCATION;
    } else if (name == "schemaLocation") {
        m_event = EQXP_XSI_SCHEMA_LOCATION;
    } else {
        m_event = EQXP_UNKNOWN_ITEM;
    }
}

bool c_xml_reader::get_simple_type_value(const std::string& name, eqbx_whitespace mode, std::string* value,
                                         eqbx_error* error, bool* is_empty) {
    value->clear();
    if (!skip_start_tag(is_empty)) {
        *error = EQBX_BAD_START_TAG_END;
        return false;
    }
    if (*is_empty) return true;
    if (!get_element_value(value, mode, true)) {
        *error = EQBX_ELEMENT_VALUE_UNREADABLE;
        return false;
    }
    if (is_element_end_tag(name)) return true;
    *error = EQBX_BAD_END_OF_ELEMENT;
    return false;
}

bool c_xml_reader::get_element_ur_value(const std::string& name, std::string* value, eqbx_error* error,
                                        bool* is_empty) {
    value->clear();
    if (!skip_start_tag(is_empty)) {
        *error = EQBX_BAD_START_TAG_END;
        return false;
    }
    if (*is_empty) return true;
    std::string end_name;
    const bool read = get_nested_element_value(value, &end_name, EQBX_WS_PRESERVE, false);
    if (end_name == name) return true;
    *error = read ? EQBX_BAD_END_OF_ELEMENT : EQBX_ELEMENT_VALUE_UNREADABLE;
    return false;
}

bool c_xml_reader::get_nested_element_value(std::string* value, std::string* end_name, eqbx_whitespace mode,
                                            bool unused_flag) {
    if (!c_xml::get_nested_element_value(value, end_name, mode, unused_flag)) return false;
    m_event = EQXP_END_TAG;
    return true;
}

bool c_xml_reader::get_xsi_type(int* ns_id, std::string* type_name) {
    return c_xml::get_xsi_type(m_scope, ns_id, type_name);
}

bool c_xml_reader::is_xsi_attribute(const std::string& qname) const {
    return c_xml::is_xsi_attribute(m_scope, qname);
}

bool c_xml_reader::get_named_attribute(int ns_id, const std::string& local_name, std::string* value) {
    return c_xml::get_named_attribute(m_scope, ns_id, local_name, value);
}

void c_xml_reader::add_namespace_mapping(const std::string& prefix, const std::string& uri) {
    m_mappings.emplace_back(prefix, uri);
}

void c_xml_reader::add_default_namespace_mapping(const std::string& uri) { add_namespace_mapping("", uri); }

void c_xml_reader::set_ns_map(const s_ns_map* map) {
    for (const s_ns_map* row = map; row->uri != nullptr; ++row) add_namespace(row->uri, row->id);
    for (const auto& mapping : m_mappings) {
        m_root_scope.add_namespace(mapping.first.c_str(), add_namespace(mapping.second.c_str()));
    }
}

std::string& c_xml_reader::get_namespace(const std::string& name, std::string* out) const {
    const int id = get_ns_id(m_scope, name);
    const char* const uri = find_namespace_from_id(id);
    if (id == k_ns_none) {
        out->clear();
    } else if (uri == nullptr) {
        *out = k_namespace_not_found;
    } else {
        *out = uri;
    }
    return *out;
}

bool c_xml_reader::is_valid_qname(const std::string& name) const {
    const c_cracked_name cracked(m_scope, name);
    if (cracked.get_ns_id() == k_ns_not_found) return false;
    const std::string& prefix = cracked.get_ns_prefix();
    if (cracked.get_has_ns_prefix() && !is_ascii_ncname(prefix.data(), prefix.size())) return false;
    return is_ascii_ncname(cracked.local_name_data(), cracked.local_name_size());
}

c_xml_reader_file::c_xml_reader_file(std::FILE* file) : c_owned_source(file), c_xml_reader(m_source) {}
c_xml_reader_file::c_xml_reader_file(const char* path) : c_owned_source(path), c_xml_reader(m_source) {}
c_xml_reader_file::c_xml_reader_file(const wchar_t* path) : c_owned_source(path), c_xml_reader(m_source) {}
c_xml_reader_file::~c_xml_reader_file() = default;

c_xml_reader_memory::c_xml_reader_memory(const char* data, std::size_t size)
    : c_owned_source(data, size), c_xml_reader(m_source) {}
c_xml_reader_memory::~c_xml_reader_memory() = default;

c_known_elements_selector::c_known_elements_selector(c_xml_reader& reader, const s_known_elements* known)
    : m_reader(reader), m_previous(reader.get_known_elements()) {
    m_reader.set_known_elements(known);
}

c_known_elements_selector::~c_known_elements_selector() { m_reader.set_known_elements(m_previous); }

}  // namespace qbxV2
