#pragma once

#include <iosfwd>
#include <string>

#include "V2/format.h"
#include "V2/frame/unmarshal.h"
#include "runtime/xml_reader.h"
#include "runtime/xml_writer.h"

/// What an element that can be a document of its own offers: whole documents in and out.
namespace vrl_v2::frame {

using qbxV2::eqbx_error;

/// One call of a class's `marshal` behind an untyped object, so that the routes below stand once.
struct document_element {
    const void* self;
    const char* name;
    eqbx_error (*write)(const void* self, qbxV2::c_xml_writer& out, const char* name);
};

eqbx_error marshal_to_stream(const document_element& element, std::ostream& os);
/// Leaves the text alone on failure.
eqbx_error marshal_to_string(const document_element& element, std::string* text);
/// EQBX_FILE_NOT_OPENED when the file cannot be created; on any other failure the file is deleted.
eqbx_error marshal_to_path(const document_element& element, const char* path);

template <class T>
document_element as_document(const T& self, const char* name) {
    return {&self, name, [](const void* object, qbxV2::c_xml_writer& out, const char* element_name) {
                return static_cast<const T*>(object)->marshal(out, element_name);
            }};
}

template <class T>
eqbx_error unmarshal_document(T& self, qbxV2::c_xml_reader& reader, const char* local_name,
                              const char* source, int line = __builtin_LINE()) {
    reader.set_ns_map(document_namespaces());
    qbxV2::c_xml_reader_local scope(reader);
    const eqbx_error failed = find_document_element(reader, local_name, source, line);
    if (failed != qbxV2::EQBX_NO_ERROR) return failed;
    // Parsing constructors come here, too, and mean their own class's function.
    return self.unmarshal(reader, reader.element_name_buffer());  // NOLINT(*.VirtualCall)
}

template <class T>
eqbx_error unmarshal_memory(T& self, const char* bytes, std::size_t length) {
    qbxV2::c_xml_reader_memory reader(bytes, length);
    return self.unmarshal(reader);
}

template <class T>
eqbx_error unmarshal_path(T& self, const char* path) {
    qbxV2::c_xml_reader_file reader(path);
    return reader.is_open() ? self.unmarshal(reader) : qbxV2::EQBX_FILE_NOT_OPENED;
}

}  // namespace vrl_v2::frame
