#pragma once

#include <cstddef>
#include <iosfwd>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "platform/api.h"
#include "runtime/error.h"
#include "runtime/error_codes.h"

namespace qbxV2 {

struct s_ns_map;

/// Streams one document, or one element tree, to a narrow byte stream as UTF-8.
///
/// The writer builds no tree and holds no element stack: a caller writes tags and values itself and takes
/// from the writer the XML declaration, the indentation, the line ends, the namespace attributes of the
/// first element, and the record of an error.
///
/// Lifetime   The stream, the tab text, the line-end text and the selected map are borrowed, and must
///            outlive the writer. The stream is imbued with the classic locale and stays so.
/// Failure    The stream's state is never looked at: a full disk goes unnoticed here.
/// Threads    One thread at a time; two writers on two streams are independent.
class VRL_API c_xml_writer {
public:
    static constexpr int include_xml_decl = 1;
    static constexpr int include_standalone = 2;

    /// Writes the declaration when `flags` has one of the two bits; `include_standalone` alone does too.
    c_xml_writer(std::ostream& os, int flags, const char* tab, const char* nl);
    /// Never writes a declaration.
    c_xml_writer(std::ostream& os, const char* tab, const char* nl);
    c_xml_writer(const c_xml_writer&) = delete;
    c_xml_writer& operator=(const c_xml_writer&) = delete;

    /// Neither writes nor flushes the stream.
    virtual ~c_xml_writer();

    /// The hook of `handle_error`. The default asks the form with one argument.
    virtual eqbx_error user_handle_error(eqbx_error error, const std::string& item_name, const char* file,
                                         int line);
    /// The default returns `error`. Return EQBX_NO_ERROR to go on as if nothing had happened.
    virtual eqbx_error user_handle_error(eqbx_error error);

    /// "'item'-text of the code", or "No Error" with no item. Returns `*out`.
    virtual std::string& get_error_message(std::string* out) const;

    /// The line-end text. Writes nothing: the caller streams the result.
    virtual const char* endl();
    /// Writes the tab text once.
    virtual void nest();

    /// The stream, behind one `nest` for each indent level where `do_indent` is true.
    std::ostream& operator()(bool do_indent);

    void indent();
    /// Does nothing at level 0.
    void undent();

    /// Extra declarations and locations. They take effect until the first element has been written.
    void add_namespace(const std::string& prefix, const std::string& uri);
    void add_default_namespace(const std::string& uri);
    void add_schema_location(const std::string& ns, const std::string& location);
    void add_no_namespace_schema_location(const std::string& location);

    /// The first map wins for the life of the writer.
    void conditionally_select_ns_map(const s_ns_map* map);
    /// Writes the namespace attributes once: the selected map, the extra ones, `xmlns:xsi` (if asked for,
    /// or if there is a schema location), the schema locations. No value is escaped.
    void conditionally_write_ns_attrs(bool include_xsi);
    /// Lets the next `conditionally_write_ns_attrs` write again.
    void reenable_namespace_map_output();
    /// The prefix of a URI: the map's before an added one; null for an unknown URI.
    const char* get_namespace_prefix(const std::string& uri) const;

    /// The class that a reader would expect at this place without `xsi:type`; compared by pointer.
    void set_expected_class_identity(const char* id) { m_expected_identity = id; }
    const char* get_expected_class_identity() const { return m_expected_identity; }
    void clear_expected_class_identity() { m_expected_identity = nullptr; }

    /// Records a failure found while marshalling; returns what `user_handle_error` makes of it.
    eqbx_error handle_error(eqbx_error error, const std::string& item_name, const char* file, int line);
    /// Reads the embedded `c_error`, which the writer itself never feeds: false after a marshalling error.
    bool get_error_info(eqbx_error_type* type, eqbx_error* error, int* line);
    const std::string& get_error_item_name() const { return m_item_name; }

    /// Gathers output while elements of the model are written, so that the stream is called once in a
    /// while and not once a piece. Between `open_element` and the outermost `close_element` pieces may
    /// wait in the writer's buffer; `operator()` and every virtual call find them in the stream.
    void open_element();
    void close_element();
    /// Instead of `close_element` while an exception is on its way: the stream's own stays back.
    void abandon_element() noexcept;
    void put(const char* text, std::size_t length);
    void put(const char* text);
    /// As `operator()(true)`.
    void put_indent();
    /// As streaming `endl()`.
    void put_line_end();
    /// True while pieces may bypass the stream's own formatting: it would give the same text, and no
    /// subclass waits to be asked.
    bool is_gathering() const { return m_gathering; }
    /// The buffer behind `put`, for text forms that append; only while `is_gathering`.
    std::string& gathered() { return m_pending; }
    /// A date written through the stream leaves "0" as its fill character; so does one that was gathered.
    void note_zero_fill() { m_zero_fill = true; }

private:
    using pair_list = std::vector<std::pair<std::string, std::string>>;

    void write_declaration(int flags);
    void write_namespace(std::string_view prefix, std::string_view uri);
    void write_schema_locations();
    void put_through();

    std::ostream& m_os;
    int m_level = 0;
    const char* m_tab;
    const char* m_nl;
    bool m_ns_attrs_written = false;
    c_error m_error_sink;
    eqbx_error m_last_error = EQBX_NO_ERROR;
    std::string m_item_name;
    const s_ns_map* m_map = nullptr;
    pair_list m_extra_namespaces;
    pair_list m_schema_locations;
    const char* m_expected_identity = nullptr;

    std::string m_pending;
    std::size_t m_open_elements = 0;
    bool m_gathering = false;
    bool m_zero_fill = false;
};

}  // namespace qbxV2
