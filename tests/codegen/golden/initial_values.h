// Generated from schema/initial_values.xsd. To change it, change the schema or V2/frame.
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

class VRL_API Lamp {
public:
    Lamp();
    Lamp(Lamp const& other);
    Lamp& operator=(Lamp const& other);
    virtual ~Lamp();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Lamp& other);
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
    Lamp(std::string const& text, qbxV2::eqbx_error* error);
    Lamp(char const* bytes, unsigned length, qbxV2::eqbx_error* error);
    Lamp(char const* path, qbxV2::eqbx_error* error);

    std::wstring const& get_Color() const;
    qbxV2::eqbx_error set_Color(std::wstring const& value);
    bool isset_Color() const;
    void unset_Color();

    double get_Power() const;
    qbxV2::eqbx_error set_Power(double value);

    unsigned int get_Sockets() const;
    qbxV2::eqbx_error set_Sockets(unsigned int value);
    bool isset_Sockets() const;
    void unset_Sockets();

    std::wstring const& get_Motto() const;
    qbxV2::eqbx_error set_Motto(std::wstring const& value);

    bool get_Lit() const;
    qbxV2::eqbx_error set_Lit(bool value);

protected:
    friend struct frame::access;
    void make_room_for(Lamp const& other);
    void exchange(Lamp& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    void init();
    frame::single<std::wstring> m_Color;
    frame::single<double> m_Power;
    frame::single<unsigned int> m_Sockets;
    frame::single<std::wstring> m_Motto;
    frame::single<bool> m_Lit;
};

}  // namespace vrl_v2
