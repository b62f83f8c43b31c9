#pragma once

#include "V2/frame/access.h"
#include "runtime/xml_writer.h"

/// The frame around writing one element: its cardinality test, its tags, its attributes, its content.
namespace vrl_v2::frame {

/// What sets one class's element apart from another's when it is written.
struct written_kind {
    bool declares_namespaces = false;  ///< may stand outermost, and then carries the namespace attributes
    bool has_text_only = false;        ///< simple content, on one line
    const char* id = nullptr;          ///< identity of a class that takes part in type substitution
    const char* xsi_type = nullptr;    ///< its name in the document, with the prefix
};

/// Start tag up to and without its end; the outermost element of a writer declares the namespaces.
void open_start_tag(qbxV2::c_xml_writer& out, const char* name, const written_kind& kind);
void close_as_nil(qbxV2::c_xml_writer& out);
void end_start_tag_of_children(qbxV2::c_xml_writer& out);
void end_start_tag_of_text(qbxV2::c_xml_writer& out);
void write_end_tag_of_children(qbxV2::c_xml_writer& out, const char* name);
void write_end_tag_of_text(qbxV2::c_xml_writer& out, const char* name);

/// Keeps the writer gathering while an element is open; what was written stands when it ends.
class open_element {
public:
    explicit open_element(qbxV2::c_xml_writer& out) : m_out(out) { out.open_element(); }
    open_element(const open_element&) = delete;
    open_element& operator=(const open_element&) = delete;
    ~open_element() {
        if (m_open) m_out.abandon_element();
    }

    /// Hands over what waits. The stream may throw here, as it may in every write; a destructor must not.
    void close() {
        m_open = false;
        m_out.close_element();
    }

private:
    qbxV2::c_xml_writer& m_out;
    bool m_open = true;
};

/// Writes what stands between the cardinality test and the end. On a failure of a child, the start tag stays
/// open and the indentation raised: nothing is written behind an error.
template <class T>
qbxV2::eqbx_error marshal_complete(const T& self, qbxV2::c_xml_writer& out, const char* name,
                                   const written_kind& kind) {
    open_start_tag(out, name, kind);
    access::marshal_attributes(self, out);
    if (access::is_nil(&self, 0)) {
        close_as_nil(out);
        return qbxV2::EQBX_NO_ERROR;
    }
    if (kind.has_text_only) {
        end_start_tag_of_text(out);
        access::marshal_content(self, out);
        write_end_tag_of_text(out, name);
        return qbxV2::EQBX_NO_ERROR;
    }
    end_start_tag_of_children(out);
    const qbxV2::eqbx_error failed = access::marshal_content(self, out);
    if (failed != qbxV2::EQBX_NO_ERROR) return failed;
    write_end_tag_of_children(out, name);
    return qbxV2::EQBX_NO_ERROR;
}

/// Writes `self` as an element called `name`.
template <class T>
qbxV2::eqbx_error marshal(const T& self, qbxV2::c_xml_writer& out, const char* name,
                          const written_kind& kind) {
    if (!self.T::is_occurs_ok()) return qbxV2::EQBX_OCCURS_ERROR_ON_MARSHAL;
    open_element gathering(out);
    const qbxV2::eqbx_error result = marshal_complete(self, out, name, kind);
    gathering.close();
    return result;
}

}  // namespace vrl_v2::frame
