// Generated from schema/text.xsd. To change it, change the schema or V2/frame.
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
constexpr char k_source[] = "V2/text.cpp";

constexpr frame::no_limits k_any;

// Names, a row each, and which of them may follow at each position.
constexpr qbxV2::s_event_map k_Weight_attributes[] = {
    {qbxV2::k_ns_none, "Unit", 4, token::a_Unit},
};

}  // namespace

// Weight

Weight::Weight() = default;
Weight::Weight([[maybe_unused]] Weight const& other) {
    frame::copy_optional(m_Unit, other.m_Unit, k_any);
    frame::copy_required(m_Weight, other.m_Weight, k_any);
}
Weight& Weight::operator=(Weight const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Weight::~Weight() = default;

void Weight::swap(Weight& other) { frame::swap_whole(*this, other); }
void Weight::make_room_for(Weight const&) {}
void Weight::exchange([[maybe_unused]] Weight& other) noexcept {
    m_Unit.swap(other.m_Unit);
    m_Weight.swap(other.m_Weight);
}
void Weight::reset() { frame::reset_by_swap(*this); }
bool Weight::is_occurs_ok() const { return m_Weight.set; }

qbxV2::eqbx_error Weight::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true, .has_text_only = true});
}
qbxV2::eqbx_error Weight::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source, .has_text_only = true};
    return frame::unmarshal(*this, kind, reader, name);
}

std::wstring const& Weight::get_Unit() const { return m_Unit.value; }
qbxV2::eqbx_error Weight::set_Unit(std::wstring const& value) { return frame::set(m_Unit, value, k_any); }
bool Weight::isset_Unit() const { return m_Unit.set; }
void Weight::unset_Unit() { m_Unit.set = false; }

double Weight::get_Weight() const { return m_Weight.value; }
qbxV2::eqbx_error Weight::set_Weight(double value) { return frame::set(m_Weight, value, k_any); }

bool Weight::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name,
                                  qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_Weight_attributes);
    switch (in.which()) {
        case 0:
            return in.read(m_Unit, k_any);
        default:
            return false;
    }
}

qbxV2::eqbx_error Weight::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Weight::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error,
                            bool has_content) {
    frame::text_reader in(reader, *name, error, k_source);
    return in.read(m_Weight, k_any, has_content);
}

void Weight::marshal_attributes(qbxV2::c_xml_writer& out) const {
    frame::attributes_writer w(out);
    w.if_set(m_Unit, "Unit");
}

qbxV2::eqbx_error Weight::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    if (m_Weight.set) frame::put_value(out, m_Weight.value);
    return qbxV2::EQBX_NO_ERROR;
}

// Remark

Remark::Remark() = default;
Remark::Remark([[maybe_unused]] Remark const& other) {
    frame::copy_optional(m_Remark, other.m_Remark, k_any);
}
Remark& Remark::operator=(Remark const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Remark::~Remark() = default;

void Remark::swap(Remark& other) { frame::swap_whole(*this, other); }
void Remark::make_room_for(Remark const&) {}
void Remark::exchange([[maybe_unused]] Remark& other) noexcept {
    m_Remark.swap(other.m_Remark);
}
void Remark::reset() { frame::reset_by_swap(*this); }
bool Remark::is_occurs_ok() const { return true; }

qbxV2::eqbx_error Remark::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true, .has_text_only = true});
}
qbxV2::eqbx_error Remark::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source, .has_text_only = true};
    return frame::unmarshal(*this, kind, reader, name);
}

std::wstring const& Remark::get_Remark() const { return m_Remark.value; }
qbxV2::eqbx_error Remark::set_Remark(std::wstring const& value) { return frame::set(m_Remark, value, k_any); }
bool Remark::isset_Remark() const { return m_Remark.set; }
void Remark::unset_Remark() { m_Remark.set = false; }

bool Remark::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error Remark::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Remark::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error,
                            bool has_content) {
    frame::text_reader in(reader, *name, error, k_source);
    return in.read(m_Remark, k_any, has_content);
}

void Remark::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Remark::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    if (m_Remark.set) frame::put_value(out, m_Remark.value);
    return qbxV2::EQBX_NO_ERROR;
}

// NetWeight

NetWeight::NetWeight() = default;
NetWeight::NetWeight(NetWeight const& other) = default;
NetWeight& NetWeight::operator=(NetWeight const& other) = default;
NetWeight::~NetWeight() = default;
qbxV2::eqbx_error NetWeight::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    out.conditionally_select_ns_map(document_namespaces());
    return Weight::marshal(out, name);
}
qbxV2::eqbx_error NetWeight::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    return Weight::unmarshal(reader, name);
}

qbxV2::eqbx_error NetWeight::marshal(std::ostream& os) const {
    return frame::marshal_to_stream(frame::as_document(*this, "Vrl:NetWeight"), os);
}
qbxV2::eqbx_error NetWeight::marshal(std::string* text) const {
    return frame::marshal_to_string(frame::as_document(*this, "Vrl:NetWeight"), text);
}
qbxV2::eqbx_error NetWeight::marshal(char const* path) const {
    return frame::marshal_to_path(frame::as_document(*this, "Vrl:NetWeight"), path);
}
qbxV2::eqbx_error NetWeight::unmarshal(qbxV2::c_xml_reader& reader) {
    return frame::unmarshal_document(*this, reader, "NetWeight", k_source);
}
qbxV2::eqbx_error NetWeight::unmarshal(std::string const& text) {
    return frame::unmarshal_memory(*this, text.data(), text.size());
}
qbxV2::eqbx_error NetWeight::unmarshal(char const* bytes, unsigned length) {
    return frame::unmarshal_memory(*this, bytes, length);
}
qbxV2::eqbx_error NetWeight::unmarshal(char const* path) { return frame::unmarshal_path(*this, path); }
NetWeight::NetWeight(std::string const& text, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(text);
}
NetWeight::NetWeight(char const* bytes, unsigned length, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(bytes, length);
}
NetWeight::NetWeight(char const* path, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(path);
}

}  // namespace vrl_v2
