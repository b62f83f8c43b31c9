// Generated from schema/values.xsd. To change it, change the schema or V2/frame.
#include <string_view>
#include <utility>

#include "V2/Vrl.h"
#include "V2/format.h"
#include "V2/frame/group.h"
#include "V2/frame/marshal.h"
#include "V2/frame/members.h"
#include "V2/frame/reading.h"
#include "V2/frame/standalone.h"
#include "V2/frame/unmarshal.h"
#include "V2/frame/writing.h"
#include "V2/tokens.h"

namespace vrl_v2 {
namespace {

// Where reports say they were raised.
constexpr char k_source[] = "V2/values.cpp";

constexpr frame::range k_Share = frame::range().from(0.0).below(1.0);
constexpr frame::range k_Parcel_Height = frame::range().above(0.0).to(2.5);
constexpr frame::no_limits k_any;
constexpr frame::length k_Parcel_Code{2, 8};
constexpr frame::collapsed<frame::no_limits> k_anyURI{};
constexpr frame::collapsed<frame::length> k_Parcel_Route{{1}};
constexpr frame::whole k_int{"-2147483648", "2147483647"};
constexpr frame::whole k_Parcel_Count{"1", "99"};
constexpr frame::whole k_Parcel_Shelf{"0", "255"};

// Names, a row each, and which of them may follow at each position.
constexpr qbxV2::s_event_map k_Parcel_children[] = {
    {k_document_namespace_id, "Fill", 4, token::e_Fill},
    {k_document_namespace_id, "Height", 6, token::e_Height},
    {k_document_namespace_id, "Tilt", 4, token::e_Tilt},
    {k_document_namespace_id, "Label", 5, token::e_Label},
    {k_document_namespace_id, "Code", 4, token::e_Code},
    {k_document_namespace_id, "Address", 7, token::e_Address},
    {k_document_namespace_id, "Route", 5, token::e_Route},
    {k_document_namespace_id, "Fragile", 7, token::e_Fragile},
    {k_document_namespace_id, "Balance", 7, token::e_Balance},
    {k_document_namespace_id, "Count", 5, token::e_Count},
    {k_document_namespace_id, "Shelf", 5, token::e_Shelf},
    {k_document_namespace_id, "Sent", 4, token::e_Sent},
    {k_document_namespace_id, "Seal", 4, token::e_Seal},
};
constexpr frame::names_between k_Parcel_next[] = {
    {1, 3}, {2, 3}, {3, 5}, {4, 5}, {5, 6}, {6, 8}, {7, 8}, {8, 9}, {9, 10}, {10, 11}, {11, 12}, {12, 13},
    {13, 13}};

}  // namespace

// Parcel

Parcel::Parcel() = default;
Parcel::Parcel([[maybe_unused]] Parcel const& other) {
    frame::copy_required(m_Fill, other.m_Fill, k_Share);
    frame::copy_optional(m_Height, other.m_Height, k_Parcel_Height);
    frame::copy_required(m_Tilt, other.m_Tilt, k_any);
    frame::copy_optional(m_Label, other.m_Label, k_any);
    frame::copy_required(m_Code, other.m_Code, k_Parcel_Code);
    frame::copy_required(m_Address, other.m_Address, k_anyURI);
    frame::copy_required(m_Route, other.m_Route, k_Parcel_Route);
    frame::copy_required(m_Fragile, other.m_Fragile, k_any);
    frame::copy_required(m_Balance, other.m_Balance, k_int);
    frame::copy_required(m_Count, other.m_Count, k_Parcel_Count);
    frame::copy_required(m_Shelf, other.m_Shelf, k_Parcel_Shelf);
    frame::copy_required(m_Sent, other.m_Sent, k_any);
    frame::copy_required(m_Seal, other.m_Seal, k_any);
}
Parcel& Parcel::operator=(Parcel const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Parcel::~Parcel() = default;

void Parcel::swap(Parcel& other) { frame::swap_whole(*this, other); }
void Parcel::make_room_for(Parcel const&) {}
void Parcel::exchange([[maybe_unused]] Parcel& other) noexcept {
    m_Fill.swap(other.m_Fill);
    m_Height.swap(other.m_Height);
    m_Tilt.swap(other.m_Tilt);
    m_Label.swap(other.m_Label);
    m_Code.swap(other.m_Code);
    m_Address.swap(other.m_Address);
    m_Route.swap(other.m_Route);
    m_Fragile.swap(other.m_Fragile);
    m_Balance.swap(other.m_Balance);
    m_Count.swap(other.m_Count);
    m_Shelf.swap(other.m_Shelf);
    m_Sent.swap(other.m_Sent);
    m_Seal.swap(other.m_Seal);
}
void Parcel::reset() { frame::reset_by_swap(*this); }
bool Parcel::is_occurs_ok() const {
    return m_Fill.set && m_Tilt.set && m_Code.set && m_Address.set && m_Route.set && m_Fragile.set &&
           m_Balance.set && m_Count.set && m_Shelf.set && m_Sent.set;
}

qbxV2::eqbx_error Parcel::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Parcel::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source, .accepts_empty = true};
    return frame::unmarshal(*this, kind, reader, name);
}

double Parcel::get_Fill() const { return m_Fill.value; }
qbxV2::eqbx_error Parcel::set_Fill(double value) { return frame::set(m_Fill, value, k_Share); }

double Parcel::get_Height() const { return m_Height.value; }
qbxV2::eqbx_error Parcel::set_Height(double value) { return frame::set(m_Height, value, k_Parcel_Height); }
bool Parcel::isset_Height() const { return m_Height.set; }
void Parcel::unset_Height() { m_Height.set = false; }

double Parcel::get_Tilt() const { return m_Tilt.value; }
qbxV2::eqbx_error Parcel::set_Tilt(double value) { return frame::set(m_Tilt, value, k_any); }

std::wstring const& Parcel::get_Label() const { return m_Label.value; }
qbxV2::eqbx_error Parcel::set_Label(std::wstring const& value) { return frame::set(m_Label, value, k_any); }
bool Parcel::isset_Label() const { return m_Label.set; }
void Parcel::unset_Label() { m_Label.set = false; }

std::wstring const& Parcel::get_Code() const { return m_Code.value; }
qbxV2::eqbx_error Parcel::set_Code(std::wstring const& value) {
    return frame::set(m_Code, value, k_Parcel_Code);
}

std::wstring const& Parcel::get_Address() const { return m_Address.value; }
qbxV2::eqbx_error Parcel::set_Address(std::wstring const& value) {
    return frame::set(m_Address, value, k_anyURI);
}

std::wstring const& Parcel::get_Route() const { return m_Route.value; }
qbxV2::eqbx_error Parcel::set_Route(std::wstring const& value) {
    return frame::set(m_Route, value, k_Parcel_Route);
}

bool Parcel::get_Fragile() const { return m_Fragile.value; }
qbxV2::eqbx_error Parcel::set_Fragile(bool value) { return frame::set(m_Fragile, value, k_any); }

int Parcel::get_Balance() const { return m_Balance.value; }
qbxV2::eqbx_error Parcel::set_Balance(int value) { return frame::set(m_Balance, value, k_int); }

unsigned int Parcel::get_Count() const { return m_Count.value; }
qbxV2::eqbx_error Parcel::set_Count(unsigned int value) { return frame::set(m_Count, value, k_Parcel_Count); }

unsigned char Parcel::get_Shelf() const { return m_Shelf.value; }
qbxV2::eqbx_error Parcel::set_Shelf(unsigned char value) {
    return frame::set(m_Shelf, value, k_Parcel_Shelf);
}

qbxV2::c_datetime const& Parcel::get_Sent() const { return m_Sent.value; }
qbxV2::eqbx_error Parcel::set_Sent(qbxV2::c_datetime const& value) {
    return frame::set(m_Sent, value, k_any);
}

qbxV2::c_binary const& Parcel::get_Seal() const { return m_Seal.value; }
qbxV2::eqbx_error Parcel::set_Seal(qbxV2::c_binary const& value) { return frame::set(m_Seal, value, k_any); }

bool Parcel::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error Parcel::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Parcel::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Parcel_children, k_Parcel_next);
    in.begin({0, 1});
    in.required(0, m_Fill, k_Share);
    in.optional(1, m_Height, k_Parcel_Height);
    in.required(2, m_Tilt, k_any);
    in.optional(3, m_Label, k_any);
    in.required(4, m_Code, k_Parcel_Code);
    in.required(5, m_Address, k_anyURI);
    in.optional(6, m_Route, k_Parcel_Route);
    in.required(7, m_Fragile, k_any);
    in.required(8, m_Balance, k_int);
    in.required(9, m_Count, k_Parcel_Count);
    in.required(10, m_Shelf, k_Parcel_Shelf);
    in.required(11, m_Sent, k_any);
    in.required(12, m_Seal, k_any);
    return in.done();
}

void Parcel::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Parcel::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.required(m_Fill, "Vrl:Fill");
    w.optional(m_Height, "Vrl:Height");
    w.required(m_Tilt, "Vrl:Tilt");
    w.optional(m_Label, "Vrl:Label");
    w.required(m_Code, "Vrl:Code");
    w.required(m_Address, "Vrl:Address");
    w.required(m_Route, "Vrl:Route");
    w.required(m_Fragile, "Vrl:Fragile");
    w.required(m_Balance, "Vrl:Balance");
    w.required(m_Count, "Vrl:Count");
    w.required(m_Shelf, "Vrl:Shelf");
    w.required(m_Sent, "Vrl:Sent");
    w.required(m_Seal, "Vrl:Seal");
    return w.result();
}

}  // namespace vrl_v2
