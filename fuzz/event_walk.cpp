#include "fuzz/event_walk.h"

namespace fuzz {
namespace {

using namespace qbxV2;

// A walk this long has seen what its input has; events behind a fault could go on for ever.
constexpr unsigned k_max_steps = 1000;
constexpr unsigned k_max_failures = 5;  // in a row: behind a fatal one there is nothing else
constexpr unsigned k_max_depth = 100;

constexpr int k_token_of_a = EQXP_FIRST_TOKEN;
constexpr int k_token_of_b = EQXP_FIRST_TOKEN + 1;
constexpr int k_document_namespace = 1000;

const s_event_map k_names[] = {
    {k_document_namespace, "a", 1, k_token_of_a}, {k_ns_none, "b", 1, k_token_of_b}, {0, nullptr, 0, 0}};
const s_known_elements k_known[] = {{k_ns_none, "c", 1}, {0, nullptr, 0}};
const s_ns_map k_namespaces[] = {{k_document_namespace, "Vrl", "urn:vrl:document/v2"}, {0, nullptr, nullptr}};

}  // namespace

std::string event_walk::run() {
    m_reader.set_known_elements(k_known);
    m_reader.set_ns_map(k_namespaces);
    while (read_event() == after::goes_on) {
    }
    m_reader.rewind();
    m_failures = 0;
    m_reader.set_ns_map(k_namespaces);
    read_event();
    return m_log;
}

event_walk::after event_walk::read_event() {
    if (++m_steps > k_max_steps) return after::ends;
    c_xml_reader_local scope(m_reader);
    eqbx_error error = EQBX_NO_ERROR;
    std::string name;
    if (m_steps % 7 == 0) {
        m_reader.get_known_element_event(k_names, &error, &name);
    } else {
        m_reader.get_element_event(m_steps % 3 == 0 ? nullptr : k_names, &error, &name);
    }
    note("event", error, name);
    if (m_reader.is_current_event_tokenisable()) read_element(name);
    m_failures = error == EQBX_NO_ERROR ? 0 : m_failures + 1;
    return m_failures == k_max_failures || m_reader.get_current_event() == EQXP_END_OF_MESSAGE
               ? after::ends
               : after::goes_on;
}

/// Stands behind the name of a start tag.
void event_walk::read_element(const std::string& name) {
    c_string_stack_node node(m_reader.get_element_name_stack(), name);
    std::string text;
    eqbx_error error = EQBX_NO_ERROR;
    bool is_empty = false;
    switch (choose(name, 12)) {
        case 0:
            note("skip rest", m_reader.skip_rest_of_element(name), {});
            return;
        case 1:
            note("any element", m_reader.get_any_element(name, &text, mode(), false), text);
            return;
        case 2:
            note("ur value", m_reader.get_element_ur_value(name, &text, &error, &is_empty), text);
            note("ur value ends", error * 2 + is_empty, {});
            return;
        case 3:
            note("simple value", m_reader.get_simple_type_value(name, mode(), &text, &error, &is_empty),
                 text);
            note("simple value ends", error * 2 + is_empty, {});
            return;
        case 4:
            note("skip rest of empty", m_reader.skip_rest_of_empty_element(name), {});
            return;
        case 5:
            note("skip start tag", m_reader.skip_start_tag(&is_empty), {});
            break;
        default:
            is_empty = !read_attributes();
            break;
    }
    read_content(name, is_empty);
}

/// Whether a body follows.
bool event_walk::read_attributes() {
    std::string name;
    int ns_id = 0;
    if (m_steps % 5 == 0)
        note("xsi:type", m_reader.get_xsi_type(&ns_id, &name), name + std::to_string(ns_id));
    if (m_steps % 6 == 0) note("b", m_reader.get_named_attribute(k_ns_none, "b", &m_value), m_value);
    for (;;) {
        eqbx_error error = EQBX_NO_ERROR;
        const bool found = m_reader.get_attribute_event(k_names, &error, &name);
        note("attribute", error, name);
        if (!found) return m_reader.get_current_event() == EQXP_START_TAG_END;
        if (++m_steps > k_max_steps) return false;
        read_attribute();
    }
}

void event_walk::read_attribute() {
    if (m_steps % 4 == 0) {
        note("skip value", m_reader.skip_attribute_value(), {});
    } else {
        note("value", m_reader.get_attribute_value(&m_value, mode()), m_value);
    }
}

/// Stands behind a start tag.
void event_walk::read_content(const std::string& name, bool is_empty) {
    if (is_empty) return;
    std::string text;
    std::string end_name;
    switch (choose(name, 9)) {
        case 0:
            note("element value", m_reader.get_element_value(&text, mode(), m_steps % 2 == 0), text);
            note("end tag", m_reader.is_element_end_tag(name), {});
            return;
        case 1:
            note("nested value", m_reader.get_nested_element_value(&text, &end_name, mode(), false), text);
            note("nested value ends", 0, end_name);
            return;
        case 2:
            note("skip body", m_reader.skip_element_body(name), {});
            return;
        default:
            break;
    }
    if (m_depth == k_max_depth) return;
    ++m_depth;
    while (read_event() == after::goes_on && m_reader.get_current_event() != EQXP_END_TAG) {
    }
    --m_depth;
}

unsigned event_walk::choose(const std::string& name, unsigned count) {
    unsigned hash = 2166136261U + m_steps;  // FNV-1a
    for (const char c : name) hash = (hash ^ static_cast<unsigned char>(c)) * 16777619U;
    return (hash >> 8) % count;
}

void event_walk::note(const char* what, int result, const std::string& text) {
    eqbx_error_type type = EQBX_ET_NONE;
    eqbx_error code = EQBX_NO_ERROR;
    int line = -1;
    m_reader.get_error_info(&type, &code, &line);
    const int numbers[] = {result, m_reader.get_current_event(), m_reader.get_line_no(), type, code,
                           line,   m_reader.get_ns_id()};
    if (m_form == record::compact) {
        m_log.append(reinterpret_cast<const char*>(numbers), sizeof numbers);
        m_log += text;
        return;
    }
    m_log += what;
    for (const int number : numbers) m_log += ' ' + std::to_string(number);
    m_log += " '" + text + "'\n";
}

}  // namespace fuzz
