// Generated from schema/objects.xsd. To change it, change the schema or V2/frame.
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
constexpr char k_source[] = "V2/objects.cpp";

constexpr frame::no_limits k_any;

// Names, a row each, and which of them may follow at each position.
constexpr qbxV2::s_event_map k_Lens_children[] = {
    {k_document_namespace_id, "FocalLength", 11, token::e_FocalLength},
};
constexpr frame::names_between k_Lens_next[] = {{1, 1}};
constexpr qbxV2::s_event_map k_CameraBody_children[] = {
    {k_document_namespace_id, "Maker", 5, token::e_Maker},
};
constexpr frame::names_between k_CameraBody_next[] = {{1, 1}};
constexpr qbxV2::s_event_map k_Camera_children[] = {
    {k_document_namespace_id, "Front", 5, token::e_Front},
    {k_document_namespace_id, "Back", 4, token::e_Back},
    {k_document_namespace_id, "Body", 4, token::e_Body},
    {k_document_namespace_id, "Strap", 5, token::e_Strap},
    {k_document_namespace_id, "Tripod", 6, token::e_Tripod},
};
constexpr frame::names_between k_Camera_next[] = {{1, 3}, {2, 3}, {3, 5}, {4, 5}, {5, 5}};

}  // namespace

// Lens

Lens::Lens() = default;
Lens::Lens([[maybe_unused]] Lens const& other) {
    frame::copy_required(m_FocalLength, other.m_FocalLength, k_any);
}
Lens& Lens::operator=(Lens const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Lens::~Lens() = default;

void Lens::swap(Lens& other) { frame::swap_whole(*this, other); }
void Lens::make_room_for(Lens const&) {}
void Lens::exchange([[maybe_unused]] Lens& other) noexcept {
    m_FocalLength.swap(other.m_FocalLength);
}
void Lens::reset() { frame::reset_by_swap(*this); }
bool Lens::is_occurs_ok() const { return m_FocalLength.set; }

qbxV2::eqbx_error Lens::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Lens::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

double Lens::get_FocalLength() const { return m_FocalLength.value; }
qbxV2::eqbx_error Lens::set_FocalLength(double value) { return frame::set(m_FocalLength, value, k_any); }

bool Lens::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error Lens::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Lens::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Lens_children, k_Lens_next);
    in.begin({0, 1});
    in.required(0, m_FocalLength, k_any);
    return in.done();
}

void Lens::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Lens::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.required(m_FocalLength, "Vrl:FocalLength");
    return w.result();
}

// CameraBody

CameraBody::CameraBody() = default;
CameraBody::CameraBody([[maybe_unused]] CameraBody const& other) {
    frame::copy_required(m_Maker, other.m_Maker, k_any);
}
CameraBody& CameraBody::operator=(CameraBody const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
CameraBody::~CameraBody() = default;

void CameraBody::swap(CameraBody& other) { frame::swap_whole(*this, other); }
void CameraBody::make_room_for(CameraBody const&) {}
void CameraBody::exchange([[maybe_unused]] CameraBody& other) noexcept {
    m_Maker.swap(other.m_Maker);
}
void CameraBody::reset() { frame::reset_by_swap(*this); }
bool CameraBody::is_occurs_ok() const { return m_Maker.set; }

qbxV2::eqbx_error CameraBody::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {});
}
qbxV2::eqbx_error CameraBody::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

std::wstring const& CameraBody::get_Maker() const { return m_Maker.value; }
qbxV2::eqbx_error CameraBody::set_Maker(std::wstring const& value) {
    return frame::set(m_Maker, value, k_any);
}

bool CameraBody::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error CameraBody::unmarshal_attributes_check(qbxV2::c_xml_reader&) {
    return qbxV2::EQBX_NO_ERROR;
}

bool CameraBody::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_CameraBody_children, k_CameraBody_next);
    in.begin({0, 1});
    in.required(0, m_Maker, k_any);
    return in.done();
}

void CameraBody::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error CameraBody::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.required(m_Maker, "Vrl:Maker");
    return w.result();
}

// Camera

Camera::Camera() = default;
Camera::Camera([[maybe_unused]] Camera const& other) {
    frame::copy_required(m_Front, other.m_Front);
    frame::copy_optional(m_Back, other.m_Back);
    frame::copy_required(m_Body, other.m_Body);
    frame::copy_required(m_Strap, other.m_Strap);
    frame::copy_optional(m_Tripod, other.m_Tripod);
}
Camera& Camera::operator=(Camera const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Camera::~Camera() = default;

void Camera::swap(Camera& other) { frame::swap_whole(*this, other); }
void Camera::make_room_for(Camera const& other) {
    m_Front.make_room_for(other.m_Front);
    m_Back.make_room_for(other.m_Back);
    m_Body.make_room_for(other.m_Body);
    m_Strap.make_room_for(other.m_Strap);
    m_Tripod.make_room_for(other.m_Tripod);
}
void Camera::exchange([[maybe_unused]] Camera& other) noexcept {
    m_Front.exchange(other.m_Front);
    m_Back.exchange(other.m_Back);
    m_Body.exchange(other.m_Body);
    m_Strap.exchange(other.m_Strap);
    m_Tripod.exchange(other.m_Tripod);
}
void Camera::reset() { frame::reset_by_swap(*this); }
bool Camera::is_occurs_ok() const { return m_Front.is_set() && m_Body.is_set(); }

qbxV2::eqbx_error Camera::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Camera::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

Lens const& Camera::get_Front() const { return m_Front.get(); }
Lens& Camera::get_Front() { return m_Front.get(); }
Lens& Camera::assign_Front(Lens const& value) { return m_Front.assign(value); }

Lens const& Camera::get_Back() const { return m_Back.get(); }
Lens& Camera::get_Back() { return m_Back.get(); }
Lens& Camera::assign_Back(Lens const& value) { return m_Back.assign(value); }
bool Camera::isset_Back() const { return m_Back.is_set(); }
void Camera::unset_Back() { m_Back.unset(); }

CameraBody const& Camera::get_Body() const { return m_Body.get(); }
CameraBody& Camera::get_Body() { return m_Body.get(); }
CameraBody& Camera::assign_Body(CameraBody const& value) { return m_Body.assign(value); }

Lens const& Camera::get_Strap() const { return m_Strap.get(); }
Lens& Camera::get_Strap() { return m_Strap.get(); }
Lens& Camera::assign_Strap(Lens const& value) { return m_Strap.assign(value); }

Tripod const& Camera::get_Tripod() const { return m_Tripod.get(); }
Tripod& Camera::get_Tripod() { return m_Tripod.get(); }
Tripod& Camera::assign_Tripod(Tripod const& value) { return m_Tripod.assign(value); }
bool Camera::isset_Tripod() const { return m_Tripod.is_set(); }
void Camera::unset_Tripod() { m_Tripod.unset(); }

bool Camera::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error Camera::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Camera::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Camera_children, k_Camera_next);
    in.begin({0, 1});
    in.required(0, m_Front);
    in.optional(1, m_Back);
    in.required(2, m_Body);
    in.optional(3, m_Strap);
    in.optional(4, m_Tripod);
    return in.done();
}

void Camera::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Camera::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.required(m_Front, "Vrl:Front");
    w.optional(m_Back, "Vrl:Back");
    w.required(m_Body, "Vrl:Body");
    w.required(m_Strap, "Vrl:Strap");
    w.optional(m_Tripod, "Vrl:Tripod");
    return w.result();
}

// Tripod

Tripod::Tripod() = default;
Tripod::Tripod(Tripod const& other) = default;
Tripod& Tripod::operator=(Tripod const& other) = default;
Tripod::~Tripod() = default;
qbxV2::eqbx_error Tripod::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    out.conditionally_select_ns_map(document_namespaces());
    return Lens::marshal(out, name);
}
qbxV2::eqbx_error Tripod::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    return Lens::unmarshal(reader, name);
}

qbxV2::eqbx_error Tripod::marshal(std::ostream& os) const {
    return frame::marshal_to_stream(frame::as_document(*this, "Vrl:Tripod"), os);
}
qbxV2::eqbx_error Tripod::marshal(std::string* text) const {
    return frame::marshal_to_string(frame::as_document(*this, "Vrl:Tripod"), text);
}
qbxV2::eqbx_error Tripod::marshal(char const* path) const {
    return frame::marshal_to_path(frame::as_document(*this, "Vrl:Tripod"), path);
}
qbxV2::eqbx_error Tripod::unmarshal(qbxV2::c_xml_reader& reader) {
    return frame::unmarshal_document(*this, reader, "Tripod", k_source);
}
qbxV2::eqbx_error Tripod::unmarshal(std::string const& text) {
    return frame::unmarshal_memory(*this, text.data(), text.size());
}
qbxV2::eqbx_error Tripod::unmarshal(char const* bytes, unsigned length) {
    return frame::unmarshal_memory(*this, bytes, length);
}
qbxV2::eqbx_error Tripod::unmarshal(char const* path) { return frame::unmarshal_path(*this, path); }
Tripod::Tripod(std::string const& text, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(text);
}
Tripod::Tripod(char const* bytes, unsigned length, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(bytes, length);
}
Tripod::Tripod(char const* path, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(path);
}

}  // namespace vrl_v2
