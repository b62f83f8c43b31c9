#pragma once

#include <cstddef>
#include <cstdio>
#include <string>
#include <utility>
#include <vector>

#include "platform/api.h"
#include "runtime/byte_source.h"
#include "runtime/cracked_name.h"
#include "runtime/error.h"
#include "runtime/event_map.h"
#include "runtime/namespaces.h"
#include "runtime/scanner.h"
#include "runtime/string_stack.h"

namespace qbxV2 {

class c_xml_reader;

/// The scope of one open element, kept on the stack of whoever reads it. Becomes the reader's current scope,
/// and puts the previous one back at its end.
class VRL_API c_xml_reader_local : public c_xml_local {
public:
    c_xml_reader_local() = default;
    explicit c_xml_reader_local(c_xml_reader& reader);
    c_xml_reader_local(const c_xml_reader_local&) = delete;
    c_xml_reader_local& operator=(const c_xml_reader_local&) = delete;
    ~c_xml_reader_local();

    void set_reader(c_xml_reader* reader) { m_reader = reader; }

private:
    c_xml_reader_local* m_previous = nullptr;
    c_xml_reader* m_reader = nullptr;
};

namespace detail {

/// The error record of a reader, built before the scanner that reports to it.
class c_reader_errors {
protected:
    c_error m_errors;
};

}  // namespace detail

/// The object that `unmarshal` drives: names get tokens, events get an error code, and failures a place where
/// a caller can step in (`user_handle_error`).
///
/// One reader serves one document and one thread. It borrows the source. Codes: see each call; the event
/// calls leave
/// `*error` alone where they meet no failure, so the caller sets it to EQBX_NO_ERROR before. After a fatal
/// report every event call ends with an error and delivers no element.
class VRL_API c_xml_reader : private detail::c_reader_errors, public c_xml {
public:
    /// What `get_namespace` gives for an undeclared prefix: one space, which is neither a URI nor "no
    /// namespace".
    static const std::string k_namespace_not_found;
    /// Open elements that a document may have before reading it is refused, unless `set_max_depth` says
    /// otherwise.
    static constexpr unsigned k_default_max_depth = 2000;

    explicit c_xml_reader(c_read& source);
    virtual ~c_xml_reader();

    /// The recovery point: sees each error that unmarshalling meets. EQBX_NO_ERROR makes it carry on as if
    /// the check had passed; any other result stops it and is what the caller of `unmarshal` gets. The
    /// four-argument form calls the one-argument form, which returns `code`.
    virtual eqbx_error user_handle_error(eqbx_error code, const std::string& item_name,
                                         const char* source_file, int source_line);
    virtual eqbx_error user_handle_error(eqbx_error code);
    /// The text of the current error, as in "line:17-'Vrl:Revision'-Mandatory element missing", with the line
    /// of the input position now. "No Error" when there is none. Returns `*message`.
    virtual std::string& get_error_message(std::string* message) const;

    /// Makes `code` the current error and asks `user_handle_error`, whose answer it keeps and returns.
    eqbx_error handle_error(eqbx_error code, const std::string& item_name, const char* source_file,
                            int source_line);
    /// The last error of the scanner's record, not the one that `handle_error` keeps.
    eqbx_error get_error() const { return m_errors.get_last_error(); }
    const std::string& get_error_item_name() const { return m_error_item_name; }
    bool get_error_info(eqbx_error_type* type, eqbx_error* code, int* line) const {
        return m_errors.get_error_info(type, code, line);
    }

    /// The next event of content. EQXP_NAME is cracked and, with a table, becomes a token or
    /// EQXP_UNKNOWN_ITEM.
    /// `*error`: the last error of the record for an error event (EQBX_NO_ERROR where the scanner made no
    /// report), EQBX_UNEXPECTED_END at the end of input, unchanged otherwise.
    void get_element_event(const s_event_map map[], eqbx_error* error, std::string* name);
    /// The same with the rows [first, last); an empty range holds no name.
    void get_element_event(const s_event_map* first, const s_event_map* last, eqbx_error* error,
                           std::string* name);
    /// What `get_element_event` does where the end tag of `name` follows in its plainest form. False, with
    /// nothing read, otherwise.
    bool take_end_event(const std::string& name);
    /// The next attribute. False when there is none: the current event is then EQXP_START_TAG_END or
    /// EQXP_END_TAG.
    /// `*error` is always set.
    bool get_attribute_event(const s_event_map map[], eqbx_error* error, std::string* name);
    /// As `get_element_event`, but skips elements that neither `map` nor the known elements hold.
    /// EQBX_BADLY_FORMED when skipping fails.
    void get_known_element_event(const s_event_map map[], eqbx_error* error, std::string* name);
    /// Gives the current name its token: that of the first row with its namespace and local name,
    /// EQXP_XSI_... in the XML Schema instance namespace, else EQXP_UNKNOWN_ITEM.
    void tokenise(const s_event_map map[], eqxp_attr_elem kind);
    void tokenise(const s_event_map* first, const s_event_map* last, eqxp_attr_elem kind);

    int get_current_event() const { return m_event; }
    void restore_event(int event) { m_event = event; }
    /// Whether the reader stands on the start of an element.
    bool is_current_event_tokenisable() const {
        return m_event == EQXP_NAME || m_event == EQXP_UNKNOWN_ITEM || m_event >= EQXP_FIRST_TOKEN;
    }

    /// The whole value of an element of simple type, from behind its name to behind its end. False with
    /// EQBX_BAD_START_TAG_END, EQBX_ELEMENT_VALUE_UNREADABLE or EQBX_BAD_END_OF_ELEMENT. An empty-element tag
    /// gives true with `*is_empty` and the empty value. The current event stays.
    bool get_simple_type_value(const std::string& name, eqbx_whitespace mode, std::string* value,
                               eqbx_error* error, bool* is_empty);
    /// The same for an element of any type: the value is its content as XML text.
    bool get_element_ur_value(const std::string& name, std::string* value, eqbx_error* error, bool* is_empty);
    /// As the scanner's; on success the current event is EQXP_END_TAG.
    bool get_nested_element_value(std::string* value, std::string* end_name, eqbx_whitespace mode,
                                  bool unused_flag);

    bool get_xsi_type(int* ns_id, std::string* type_name);
    bool is_xsi_attribute(const std::string& qname) const;
    bool get_named_attribute(int ns_id, const std::string& local_name, std::string* value);
    int get_line_no() const { return get_line_num(); }

    /// The open elements. Whoever descends pushes the name with a `c_string_stack_node`.
    c_string_stack& get_element_name_stack() { return m_element_names; }
    /// The number of names on the element name stack.
    unsigned depth() const { return m_element_names.count(); }
    /// How many open elements whoever descends shall allow.
    void set_max_depth(unsigned elements) { m_max_depth = elements; }
    unsigned get_max_depth() const { return m_max_depth; }

    /// The table for `get_known_element_event`, which must outlive its use. Null by default.
    void set_known_elements(const s_known_elements* known) { m_known_elements = known; }
    const s_known_elements* get_known_elements() const { return m_known_elements; }

    /// The current scope. See `c_xml_reader_local`.
    c_xml_reader_local* get_reader_local() const { return m_scope; }
    void set_reader_local(c_xml_reader_local* scope) { m_scope = scope; }

    /// Notes a prefix that documents may use without declaring it, until `set_ns_map` enters it.
    void add_namespace_mapping(const std::string& prefix, const std::string& uri);
    void add_default_namespace_mapping(const std::string& uri);
    /// Enters the namespaces of a document format and the noted mappings. Repeating it is harmless; after a
    /// rewind it is necessary.
    void set_ns_map(const s_ns_map* map);
    /// The URI for the prefix of `name`: empty for no namespace, `k_namespace_not_found` for an undeclared
    /// prefix. Returns `*out`.
    std::string& get_namespace(const std::string& name, std::string* out) const;
    /// Whether `name` is a qualified name of ASCII letters with a namespace in scope.
    bool is_valid_qname(const std::string& name) const;

    using c_xml::get_local_name;
    using c_xml::get_ns_id;
    int get_ns_id() const { return m_name.get_ns_id(); }
    bool get_has_ns_prefix() const { return m_name.get_has_ns_prefix(); }
    const std::string& get_full_name() const { return m_name.get_full_name(); }
    const std::string& get_local_name() const { return m_name.get_local_name(); }
    int get_element_ns_id() const { return m_name.get_element_ns_id(); }
    /// The name of the current event, cut up.
    const c_cracked_name& get_cracked_name() const { return m_name; }
    /// Cuts up `name` from the current scope, as the name of the current event.
    void crack_name(const std::string& name) { m_name.set(m_scope, name); }

    /// Working storage that callers pass into the calls above, so that its memory is reused.
    std::string& element_name_buffer() { return m_element_name; }
    std::string& value_buffer() { return m_value; }
    std::string& attribute_name_buffer() { return m_attribute_name; }

private:
    void next_element(eqbx_error* error, std::string* name);
    int name_id(eqxp_attr_elem kind) const;
    void tokenise_xsi();
    bool is_known_element() const;

    c_xml_reader_local* m_scope;
    c_xml_reader_local m_root_scope;
    eqbx_error m_error = EQBX_NO_ERROR;
    std::string m_error_item_name;
    c_string_stack m_element_names;
    c_cracked_name m_name;
    int m_event = 0;
    std::vector<std::pair<std::string, std::string>> m_mappings;
    const s_known_elements* m_known_elements = nullptr;
    std::string m_element_name;
    std::string m_value;
    std::string m_attribute_name;
    unsigned m_max_depth = k_default_max_depth;
};

namespace detail {

/// The source of a reader, built before the reader that reads it.
template <class Source>
class c_owned_source {
protected:
    template <class... Arguments>
    explicit c_owned_source(Arguments... arguments) : m_source(arguments...) {}
    Source m_source;
};

}  // namespace detail

/// A reader on a file. See `c_read_file`.
class VRL_API c_xml_reader_file : private detail::c_owned_source<c_read_file>, public c_xml_reader {
public:
    explicit c_xml_reader_file(std::FILE* file);
    explicit c_xml_reader_file(const char* path);
    explicit c_xml_reader_file(const wchar_t* path);
    ~c_xml_reader_file() override;
    /// False when the file could not be opened: EQBX_FILE_NOT_OPENED is the caller's to report.
    bool is_open() const { return m_source.is_open(); }
};

/// A reader on memory, which must outlive it.
class VRL_API c_xml_reader_memory : private detail::c_owned_source<c_read_memory>, public c_xml_reader {
public:
    c_xml_reader_memory(const char* data, std::size_t size);
    ~c_xml_reader_memory() override;
    bool is_open() const { return m_source.is_open(); }
};

/// Scope guard: installs a table of known elements, and puts the old one back at its end.
class VRL_API c_known_elements_selector {
public:
    c_known_elements_selector(c_xml_reader& reader, const s_known_elements* known);
    c_known_elements_selector(const c_known_elements_selector&) = delete;
    c_known_elements_selector& operator=(const c_known_elements_selector&) = delete;
    ~c_known_elements_selector();

private:
    c_xml_reader& m_reader;
    const s_known_elements* m_previous;
};

}  // namespace qbxV2
