// Generated from schema/document.xsd. To change it, change the schema or V2/frame.
#pragma once

#include <iosfwd>
#include <string>

#include "V2/document_result.h"
#include "V2/forward.h"
#include "V2/frame/storage.h"
#include "platform/api.h"
#include "runtime/values.h"
#include "runtime/xml_reader.h"
#include "runtime/xml_writer.h"

namespace vrl_v2 {

class VRL_API Vrl {
public:
    Vrl();
    Vrl(Vrl const& other);
    Vrl& operator=(Vrl const& other);
    virtual ~Vrl();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Vrl& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    /// A document that holds this element alone. The path forms give EQBX_FILE_NOT_OPENED for a file that
    /// cannot be opened; a failed write to a path deletes the file, one to a text leaves it alone.
    qbxV2::eqbx_error marshal(std::ostream& os) const;
    qbxV2::eqbx_error marshal(std::string* text) const;
    qbxV2::eqbx_error marshal(char const* path) const;
    /// Reading does not reset the object first.
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader);
    qbxV2::eqbx_error unmarshal(std::string const& text);
    qbxV2::eqbx_error unmarshal(char const* bytes, unsigned length);
    qbxV2::eqbx_error unmarshal(char const* path);
    Vrl(std::string const& text, qbxV2::eqbx_error* error);
    Vrl(char const* bytes, unsigned length, qbxV2::eqbx_error* error);
    Vrl(char const* path, qbxV2::eqbx_error* error);

    /// Reads a document: packed where the path ends in ".vrlz", plain otherwise. Does not reset the object
    /// first.
    qbxV2::eqbx_error loadFile(std::wstring const& path);
    qbxV2::eqbx_error loadString(std::wstring const& xml);
    /// Writes a document to a path that ends in ".vrl" or ".vrlz" (EQBX_USER_ERROR_2 otherwise), with CR LF
    /// at line ends. Stamps `WriteSDKInformation`, const or not. A file that can't be opened goes unnoticed.
    qbxV2::eqbx_error writeFile(std::wstring const& path) const;
    XMLDocumentResult writeString() const;

    std::wstring const& get_Title() const;
    qbxV2::eqbx_error set_Title(std::wstring const& value);
    bool isset_Title() const;
    void unset_Title();

protected:
    friend struct frame::access;
    void make_room_for(Vrl const& other);
    void exchange(Vrl& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    void init();
    frame::single<std::wstring> m_Title;
};

}  // namespace vrl_v2
