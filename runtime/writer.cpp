#include "runtime/writer.h"

#include <cstring>
#include <locale>
#include <ostream>
#include <typeinfo>

#include "runtime/namespaces.h"
#include "runtime/stream_state.h"

namespace qbxV2 {
namespace {

/// Large enough that the stream is called seldom, small enough to stay in the cache.
constexpr std::size_t k_gathered_at_once = 32 * 1024;

/// A stream's default, and that of the seconds of dates that are gathered.
constexpr std::streamsize k_gathered_precision = 6;

// Namespaces in XML: XML Schema Part 1, 2.6.
constexpr const char k_schema_instance_uri[] = "http://www.w3.org/2001/XMLSchema-instance";

/// Empties a text at the end of a scope, whichever way it ends.
class emptied_text {
public:
    explicit emptied_text(std::string& text) : m_text(text) {}
    emptied_text(const emptied_text&) = delete;
    emptied_text& operator=(const emptied_text&) = delete;
    ~emptied_text() { m_text.clear(); }

private:
    std::string& m_text;
};

}  // namespace

c_xml_writer::c_xml_writer(std::ostream& os, int flags, const char* tab, const char* nl)
    : m_os(os), m_tab(tab), m_nl(nl) {
    m_os.imbue(std::locale::classic());
    write_declaration(flags);
}

c_xml_writer::c_xml_writer(std::ostream& os, const char* tab, const char* nl)
    : c_xml_writer(os, 0, tab, nl) {}

c_xml_writer::~c_xml_writer() = default;

void c_xml_writer::write_declaration(int flags) {
    if ((flags & (include_xml_decl | include_standalone)) == 0) return;
    put("<?xml version=\"1.0\" encoding=\"UTF-8\"");
    if ((flags & include_standalone) != 0) put(" standalone=\"yes\"");
    put("?>");
    put(m_nl);
}

eqbx_error c_xml_writer::user_handle_error(eqbx_error error, const std::string&, const char*, int) {
    return user_handle_error(error);
}

eqbx_error c_xml_writer::user_handle_error(eqbx_error error) { return error; }

std::string& c_xml_writer::get_error_message(std::string* out) const {
    if (m_last_error == EQBX_NO_ERROR) {
        *out = get_error_description(EQBX_NO_ERROR);
    } else {
        *out = "'" + m_item_name + "'-" + get_error_description(m_last_error);
    }
    return *out;
}

const char* c_xml_writer::endl() { return m_nl; }

void c_xml_writer::nest() {
    put_through();
    m_os << m_tab;
}

std::ostream& c_xml_writer::operator()(bool do_indent) {
    put_through();
    if (do_indent) {
        for (int i = 0; i < m_level; ++i) nest();
    }
    return m_os;
}

void c_xml_writer::indent() { ++m_level; }

void c_xml_writer::undent() {
    if (m_level > 0) --m_level;
}

void c_xml_writer::add_namespace(const std::string& prefix, const std::string& uri) {
    m_extra_namespaces.emplace_back(prefix, uri);
}

void c_xml_writer::add_default_namespace(const std::string& uri) { add_namespace(std::string(), uri); }

void c_xml_writer::add_schema_location(const std::string& ns, const std::string& location) {
    m_schema_locations.emplace_back(ns, location);
}

void c_xml_writer::add_no_namespace_schema_location(const std::string& location) {
    add_schema_location(std::string(), location);
}

void c_xml_writer::conditionally_select_ns_map(const s_ns_map* map) {
    if (m_map == nullptr) m_map = map;
}

void c_xml_writer::write_namespace(std::string_view prefix, std::string_view uri) {
    put(" xmlns");
    if (!prefix.empty()) put(":");
    put(prefix.data(), prefix.size());
    put("=\"");
    put(uri.data(), uri.size());
    put("\"");
}

void c_xml_writer::conditionally_write_ns_attrs(bool include_xsi) {
    if (m_ns_attrs_written) return;
    if (m_map != nullptr) {
        for (const s_ns_map* row = m_map; row->uri != nullptr; ++row) write_namespace(row->prefix, row->uri);
    }
    for (const auto& extra : m_extra_namespaces) write_namespace(extra.first, extra.second);
    if (include_xsi || !m_schema_locations.empty()) write_namespace("xsi", k_schema_instance_uri);
    write_schema_locations();
    m_ns_attrs_written = true;
    endl();  // Intended: asked for and not written; the start tag stays open.
}

void c_xml_writer::write_schema_locations() {
    if (m_schema_locations.empty()) return;
    if (m_schema_locations.front().first.empty()) {
        // Intended: a first entry without namespace speaks for the whole document; the others are ignored.
        put(" xsi:noNamespaceSchemaLocation=\"");
        const std::string& location = m_schema_locations.front().second;
        put(location.data(), location.size());
    } else {
        put(" xsi:schemaLocation=\"");
        const char* separator = "";
        for (const auto& [ns, location] : m_schema_locations) {
            put(separator);
            put(ns.data(), ns.size());
            put(" ");
            put(location.data(), location.size());
            separator = " ";
        }
    }
    put("\"");
}

void c_xml_writer::reenable_namespace_map_output() { m_ns_attrs_written = false; }

const char* c_xml_writer::get_namespace_prefix(const std::string& uri) const {
    if (m_map != nullptr) {
        for (const s_ns_map* row = m_map; row->uri != nullptr; ++row) {
            if (uri == row->uri) return row->prefix;
        }
    }
    for (const auto& extra : m_extra_namespaces) {
        if (extra.second == uri) return extra.first.c_str();
    }
    return nullptr;
}

eqbx_error c_xml_writer::handle_error(eqbx_error error, const std::string& item_name, const char* file,
                                      int line) {
    m_last_error = error;
    // Intended: passing the stored name back in leaves it empty.
    m_item_name.clear();
    if (&item_name != &m_item_name) m_item_name = item_name;
    m_last_error = user_handle_error(error, item_name, file, line);
    return m_last_error;
}

bool c_xml_writer::get_error_info(eqbx_error_type* type, eqbx_error* error, int* line) {
    return m_error_sink.get_error_info(type, error, line);
}

void c_xml_writer::open_element() {
    if (m_open_elements++ == 0) {
        m_gathering = typeid(*this) == typeid(c_xml_writer) && detail::prints_plainly(m_os) &&
                      m_os.precision() == k_gathered_precision;
    }
}

void c_xml_writer::close_element() {
    if (--m_open_elements != 0) return;
    m_gathering = false;
    put_through();
}

void c_xml_writer::abandon_element() noexcept {
    try {
        close_element();
    } catch (...) {
        // The exception that is on its way says what went wrong first.
    }
}

void c_xml_writer::put(const char* text, std::size_t length) {
    if (m_gathering) {
        m_pending.append(text, length);
        if (m_pending.size() >= k_gathered_at_once) put_through();
    } else {
        m_os.write(text, static_cast<std::streamsize>(length));
    }
}

void c_xml_writer::put(const char* text) { put(text, std::strlen(text)); }

void c_xml_writer::put_indent() {
    if (m_gathering && m_tab[0] != '\0' && m_tab[1] == '\0') {
        m_pending.append(static_cast<std::size_t>(m_level), m_tab[0]);
    } else if (m_gathering) {
        for (int i = 0; i < m_level; ++i) put(m_tab);
    } else {
        (*this)(true);
    }
}

void c_xml_writer::put_line_end() {
    if (m_gathering) {
        put(m_nl);
    } else {
        put(endl());
    }
}

void c_xml_writer::put_through() {
    if (!m_pending.empty()) {
        // Gone even where the stream throws: nothing is handed over twice.
        const emptied_text after(m_pending);
        m_os.write(m_pending.data(), static_cast<std::streamsize>(m_pending.size()));
    }
    if (m_zero_fill) {
        m_os.fill('0');
        m_zero_fill = false;
    }
}

}  // namespace qbxV2
