#pragma once

#include <string>

#include "platform/api.h"
#include "runtime/attribute_buffer.h"
#include "runtime/dtd.h"
#include "runtime/namespaces.h"
#include "runtime/white_space.h"
#include "runtime/xml_event.h"
#include "runtime/xml_text_source.h"

namespace qbxV2 {

/// A pull scanner for XML: one event a call, no tree, no validation against a DTD.
///
/// Order of calls. After EQXP_NAME from `get_element_name` the caller reads the attributes
/// (`get_attribute_name`, then `get_attribute_value` or `skip_attribute_value`, until EQXP_START_TAG_END or
/// EQXP_END_TAG), or jumps over them with `skip_start_tag`. Behind a start tag with a body it reads child
/// events, or the value with `get_element_value` and `is_element_end_tag`, or skips the body.
///
/// Failures are in the error record. A fatal one ends the input for good; others leave the scanner behind the
/// fault.
class VRL_API c_xml {
public:
    /// `ws_for_char_refs` tells whether white-space handling also applies to characters written as
    /// references.
    c_xml(c_read& source, c_error& errors, bool ws_for_char_refs);
    c_xml(const c_xml&) = delete;
    c_xml& operator=(const c_xml&) = delete;

    static bool is_error_event(int event) { return event == EQXP_ERROR_EVENT || event == EQXP_ERROR; }

    /// The next event of content: EQXP_NAME, EQXP_END_TAG, EQXP_TEXT, EQXP_END_OF_MESSAGE or EQXP_ERROR, with
    /// the name or text. Reads all attributes of a start tag ahead; its namespace declarations go into
    /// `scope`.
    eqxp_xml_event get_element_name(c_xml_local* scope, std::string* name);
    /// The next attribute, or how the tag ends: EQXP_NAME, EQXP_START_TAG_END, EQXP_END_TAG or EQXP_ERROR.
    /// `in_pi` makes "?>" the end instead of "/>".
    eqxp_xml_event get_attribute_name(std::string* name, bool in_pi);
    /// The value behind the name that was just read, with its references expanded. False when one of them
    /// fails.
    bool get_attribute_value(std::string* value, eqbx_whitespace mode);
    bool skip_attribute_value();
    /// Whether the input ended where `get_attribute_name` last looked for the rest of a start tag: calling it
    /// again would report the same for ever.
    bool is_tag_cut() const { return m_tag_is_cut; }
    /// Finds an attribute from the read position on, and starts over with the first attribute either way.
    /// Without a prefix an attribute has the id of the default namespace here.
    bool get_named_attribute(const c_xml_local* scope, int ns_id, const std::string& local_name,
                             std::string* value);
    /// Simple content, up to the next tag. Comments and processing instructions vanish; CDATA sections are
    /// copied past the white-space mode. False at the end of input (EQBX_UNEXPECTED_END), for other markup
    /// (EQBX_NOT_WELL_FORMED), and for a bad reference.
    bool get_element_value(std::string* value, eqbx_whitespace mode, bool expand_entities);
    /// Whether the end tag of `name` follows. Consumes it, or what was read of something else.
    bool is_element_end_tag(const std::string& name) { return m_getter.read_end_tag(name); }
    /// Consumes the end tag of `name` where it follows in its plainest form. False, with nothing read,
    /// otherwise: `get_element_name` then tells what follows.
    bool take_end_tag(const std::string& name) { return m_getter.take_end_tag(name); }
    bool skip_start_tag(bool* is_empty) { return m_getter.move_to_start_tag_end(is_empty); }
    /// From behind the start tag of `name` to behind its end tag. Needs memory, but no stack, by depth.
    bool skip_element_body(const std::string& name);
    /// From within the start tag of `name` to behind its end.
    bool skip_rest_of_element(const std::string& name);
    /// The same for an element that must have no content.
    bool skip_rest_of_empty_element(const std::string& name);
    /// Writes an element back as XML text, from behind its name to its end; comments and processing
    /// instructions are lost, references stay as they are.
    bool get_any_element(const std::string& name, std::string* out, eqbx_whitespace mode, bool unused_flag);
    /// The rest of an element as XML text, up to and with an end tag, whose name is stored.
    bool get_nested_element_value(std::string* value, std::string* end_name, eqbx_whitespace mode,
                                  bool unused_flag);
    /// The attribute `xsi:type`, cut up; false when there is none.
    bool get_xsi_type(const c_xml_local* scope, int* ns_id, std::string* type_name);
    /// Whether the prefix of `qname` stands for the XML Schema instance namespace.
    bool is_xsi_attribute(const c_xml_local* scope, const std::string& qname) const;

    void add_general_entity(const std::string& name, const std::string& value);
    void add_parameter_entity(const std::string& name, const std::string& value);
    /// See `c_get_with_entities`.
    void set_max_entity_expansion(std::size_t bytes) { m_getter.set_max_entity_expansion(bytes); }
    bool has_exceeded_entity_expansion() const { return m_getter.has_exceeded_entity_expansion(); }
    /// See `c_get_as_utf8`.
    void use_runs(bool on) { m_getter.use_runs(on); }

    int get_line_num() const { return m_getter.get_line_num(); }
    const char* get_source_id() const { return m_getter.get_source_id(); }
    /// Back to the start of the source. Namespace ids and entities are forgotten; the error record stays.
    void rewind();

    int add_namespace(const char* uri) { return m_namespaces.add_namespace(uri); }
    void add_namespace(const char* uri, int id) { m_namespaces.add_namespace(uri, id); }
    int find_enumerated_namespace(const std::string& uri) const { return m_namespaces.find_namespace(uri); }
    const char* find_namespace_from_id(int id) const { return m_namespaces.find_namespace_from_id(id); }
    /// The id of the prefix of `qname`, or of the default namespace.
    int get_ns_id(const c_xml_local* scope, const std::string& qname) const;

    /// What stands before the first colon, or nothing. Returns `*out`, which may be `name`.
    static std::string& get_namespace_prefix(const std::string& name, std::string* out);
    /// What stands behind the first colon, or all. Returns `*out`, which may be `name`.
    static std::string& get_local_name(const std::string& name, std::string* out);

private:
    enum class step { deliver, again, fail };
    enum class piece { text, start_tag, end_tag, error };

    eqxp_xml_event deliver(eqxp_xml_event event);
    eqxp_xml_event fail_not_well_formed(const char* message);
    step get_tag_or_markup(c_xml_local* scope, std::string* name, eqxp_xml_event* event);
    step get_start_tag(int first, c_xml_local* scope, std::string* name, eqxp_xml_event* event);
    step get_tag_attributes(c_xml_local* scope, eqxp_xml_event* event);
    step get_end_tag(std::string* name, eqxp_xml_event* event);
    step get_instruction();
    step get_markup(std::string* name, eqxp_xml_event* event);
    step get_doctype();
    step get_text(int c, std::string* text, eqxp_xml_event* event);
    bool get_rest_of_text(std::string* text);

    bool get_attributes(c_xml_local* scope);
    bool get_declaration(c_xml_local* scope, std::size_t at);
    bool get_raw_value(std::string* bytes);
    bool declare_namespace(c_xml_local* scope, const char* name, const char* value);
    bool expand_declared_uri(const char* value);

    bool get_value_markup(std::string* value, bool* at_tag);

    piece get_nested_piece(std::string* text);
    piece get_nested_markup(std::string* text);
    piece get_nested_declaration(std::string* text);
    int get_nested_name(int c, std::string* name);
    bool copy_start_tag(const std::string& name, std::string* out, bool* is_empty);
    void copy_attributes(c_attribute_buffer* buffer, std::string* out);
    bool copy_element(const std::string& name, std::string* out);

    bool expand_reference(c_entity_name_reader& reader, std::string* out);
    bool resolve_reference(c_entity_name_reader& reader, std::string* out, const char** value);
    bool expand_inline(const char* value, std::string* out);

    c_get_for_xml m_getter;
    std::string m_entity_name;
    c_internal_dtd m_dtd;
    c_enumerated_namespaces m_namespaces;
    bool m_doctype_read = false;
    bool m_first_event_delivered = false;
    c_attribute_buffer m_attributes;
    bool m_tag_is_cut = false;
    c_attribute_buffer m_ns_attributes;
    std::string m_scratch;

    friend class c_xml_reader;
};

}  // namespace qbxV2
