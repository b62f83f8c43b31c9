// Generated from schema/values.xsd. To change it, change the schema or V2/frame.
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

class VRL_API Parcel {
public:
    Parcel();
    Parcel(Parcel const& other);
    Parcel& operator=(Parcel const& other);
    virtual ~Parcel();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Parcel& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    /// A share from 0 to 1, not quite 1.
    /// Refuses: EQBX_VALUE_TOO_SMALL below 0.0, EQBX_VALUE_TOO_LARGE from 1.0 up.
    double get_Fill() const;
    qbxV2::eqbx_error set_Fill(double value);

    /// Refuses: EQBX_VALUE_TOO_SMALL from 0.0 down, EQBX_VALUE_TOO_LARGE above 2.5.
    double get_Height() const;
    qbxV2::eqbx_error set_Height(double value);
    bool isset_Height() const;
    void unset_Height();

    double get_Tilt() const;
    qbxV2::eqbx_error set_Tilt(double value);

    std::wstring const& get_Label() const;
    qbxV2::eqbx_error set_Label(std::wstring const& value);
    bool isset_Label() const;
    void unset_Label();

    /// Refuses: EQBX_LENGTH_TOO_SHORT below 2 unit(s), EQBX_LENGTH_TOO_LONG above 8 unit(s).
    std::wstring const& get_Code() const;
    qbxV2::eqbx_error set_Code(std::wstring const& value);

    std::wstring const& get_Address() const;
    qbxV2::eqbx_error set_Address(std::wstring const& value);

    /// Refuses: EQBX_LENGTH_TOO_SHORT below 1 unit(s).
    std::wstring const& get_Route() const;
    qbxV2::eqbx_error set_Route(std::wstring const& value);

    bool get_Fragile() const;
    qbxV2::eqbx_error set_Fragile(bool value);

    int get_Balance() const;
    qbxV2::eqbx_error set_Balance(int value);

    /// Refuses: EQBX_VALUE_TOO_SMALL below 1, EQBX_VALUE_TOO_LARGE above 99.
    unsigned int get_Count() const;
    qbxV2::eqbx_error set_Count(unsigned int value);

    unsigned char get_Shelf() const;
    qbxV2::eqbx_error set_Shelf(unsigned char value);

    qbxV2::c_datetime const& get_Sent() const;
    qbxV2::eqbx_error set_Sent(qbxV2::c_datetime const& value);

    qbxV2::c_binary const& get_Seal() const;
    qbxV2::eqbx_error set_Seal(qbxV2::c_binary const& value);

protected:
    friend struct frame::access;
    void make_room_for(Parcel const& other);
    void exchange(Parcel& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<double> m_Fill;
    frame::single<double> m_Height;
    frame::single<double> m_Tilt;
    frame::single<std::wstring> m_Label;
    frame::single<std::wstring> m_Code;
    frame::single<std::wstring> m_Address;
    frame::single<std::wstring> m_Route;
    frame::single<bool> m_Fragile;
    frame::single<int> m_Balance;
    frame::single<unsigned int> m_Count;
    frame::single<unsigned char> m_Shelf;
    frame::single<qbxV2::c_datetime> m_Sent;
    frame::single<qbxV2::c_binary> m_Seal;
};

}  // namespace vrl_v2
