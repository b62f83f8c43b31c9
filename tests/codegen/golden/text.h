// Generated from schema/text.xsd. To change it, change the schema or V2/frame.
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

class VRL_API Weight {
public:
    Weight();
    Weight(Weight const& other);
    Weight& operator=(Weight const& other);
    virtual ~Weight();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Weight& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    std::wstring const& get_Unit() const;
    qbxV2::eqbx_error set_Unit(std::wstring const& value);
    bool isset_Unit() const;
    void unset_Unit();

    double get_Weight() const;
    qbxV2::eqbx_error set_Weight(double value);

protected:
    friend struct frame::access;
    void make_room_for(Weight const& other);
    void exchange(Weight& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error,
                        bool has_content);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<std::wstring> m_Unit;
    frame::single<double> m_Weight;
};

class VRL_API Remark {
public:
    Remark();
    Remark(Remark const& other);
    Remark& operator=(Remark const& other);
    virtual ~Remark();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Remark& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    std::wstring const& get_Remark() const;
    qbxV2::eqbx_error set_Remark(std::wstring const& value);
    bool isset_Remark() const;
    void unset_Remark();

protected:
    friend struct frame::access;
    void make_room_for(Remark const& other);
    void exchange(Remark& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error,
                        bool has_content);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<std::wstring> m_Remark;
};

class VRL_API NetWeight : public Weight {
public:
    NetWeight();
    NetWeight(NetWeight const& other);
    NetWeight& operator=(NetWeight const& other);
    ~NetWeight() override;
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

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
    NetWeight(std::string const& text, qbxV2::eqbx_error* error);
    NetWeight(char const* bytes, unsigned length, qbxV2::eqbx_error* error);
    NetWeight(char const* path, qbxV2::eqbx_error* error);
};

}  // namespace vrl_v2
