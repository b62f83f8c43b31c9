// Generated from schema/lists.xsd. To change it, change the schema or V2/frame.
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

class VRL_API Stop {
public:
    Stop();
    Stop(Stop const& other);
    Stop& operator=(Stop const& other);
    virtual ~Stop();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Stop& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    std::wstring const& get_Place() const;
    qbxV2::eqbx_error set_Place(std::wstring const& value);

protected:
    friend struct frame::access;
    void make_room_for(Stop const& other);
    void exchange(Stop& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<std::wstring> m_Place;
};

class VRL_API Journey {
public:
    Journey();
    Journey(Journey const& other);
    Journey& operator=(Journey const& other);
    virtual ~Journey();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Journey& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    unsigned size_Fare() const;
    double get_Fare(unsigned i) const;
    qbxV2::eqbx_error set_Fare(unsigned i, double value);
    qbxV2::eqbx_error append_Fare(double value);
    qbxV2::eqbx_error insert_Fare(unsigned i, double value);
    void delete_Fare(unsigned i);
    void clear_Fare();

    unsigned size_Remark() const;
    std::wstring const& get_Remark(unsigned i) const;
    qbxV2::eqbx_error set_Remark(unsigned i, std::wstring const& value);
    qbxV2::eqbx_error append_Remark(std::wstring const& value);
    qbxV2::eqbx_error insert_Remark(unsigned i, std::wstring const& value);
    void delete_Remark(unsigned i);
    void clear_Remark();

    unsigned size_Stop() const;
    Stop const& get_Stop(unsigned i) const;
    Stop& get_Stop(unsigned i);
    Stop& back_Stop();
    Stop& assign_Stop(unsigned i, Stop const& value);
    qbxV2::eqbx_error append_Stop();
    qbxV2::eqbx_error insert_Stop(unsigned i);
    void delete_Stop(unsigned i);
    void clear_Stop();

    unsigned size_Detour() const;
    Stop const& get_Detour(unsigned i) const;
    Stop& get_Detour(unsigned i);
    Stop& back_Detour();
    Stop& assign_Detour(unsigned i, Stop const& value);
    qbxV2::eqbx_error append_Detour();
    qbxV2::eqbx_error insert_Detour(unsigned i);
    void delete_Detour(unsigned i);
    void clear_Detour();

protected:
    friend struct frame::access;
    void make_room_for(Journey const& other);
    void exchange(Journey& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::list<double> m_Fare;
    frame::list<std::wstring> m_Remark;
    frame::list<Stop> m_Stop;
    frame::list<Stop> m_Detour;
};

}  // namespace vrl_v2
