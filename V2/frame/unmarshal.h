#pragma once

#include <string>

#include "V2/frame/access.h"
#include "runtime/xml_reader.h"

/// The frame around reading one element: its attributes, its content, its end.
namespace vrl_v2::frame {

/// What sets one class's element apart from another's.
struct element_kind {
    const char* source;          ///< the generated source's name, for reports
    bool has_text_only = false;  ///< simple content
    bool accepts_empty = false;  ///< a start tag without content is no error
    bool is_nillable = false;
};

/// A class as the frame sees it: its own steps, behind one untyped object.
struct element_steps {
    bool (*attribute)(void* self, qbxV2::c_xml_reader&, const std::string& name, qbxV2::eqbx_error*);
    qbxV2::eqbx_error (*required_attributes)(void* self, qbxV2::c_xml_reader&);
    bool (*body)(void* self, qbxV2::c_xml_reader&, std::string* name, qbxV2::eqbx_error*, bool has_content);
    bool (*is_nil)(const void* self);
};

qbxV2::eqbx_error unmarshal_element(void* self, const element_steps& steps, const element_kind& kind,
                                    qbxV2::c_xml_reader& reader, const std::string& name, int line);

/// Reads the element that `reader` stands on, behind its name.
template <class T>
qbxV2::eqbx_error unmarshal(T& self, const element_kind& kind, qbxV2::c_xml_reader& reader,
                            const std::string& name, int line = __builtin_LINE()) {
    static constexpr element_steps steps = access::steps_of<T, element_steps>();
    return unmarshal_element(&self, steps, kind, reader, name, line);
}

/// Reads the outermost element of a document: it has to be `local_name` of the document's namespace.
/// `read` then reads it, whatever it was, if the error handler lets it.
qbxV2::eqbx_error find_document_element(qbxV2::c_xml_reader& reader, const char* local_name,
                                        const char* source, int line);

}  // namespace vrl_v2::frame
