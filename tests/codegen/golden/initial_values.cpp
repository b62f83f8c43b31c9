// Generated from schema/initial_values.xsd. To change it, change the schema or V2/frame.
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
constexpr char k_source[] = "V2/initial_values.cpp";

constexpr frame::no_limits k_any;
constexpr frame::whole k_Lamp_Sockets{"0", "2147483647"};

// Names, a row each, and which of them may follow at each position.
constexpr qbxV2::s_event_map k_Lamp_attributes[] = {
    {qbxV2::k_ns_none, "Color", 5, token::a_Color},
};
constexpr qbxV2::s_event_map k_Lamp_children[] = {
    {k_document_namespace_id, "Power", 5, token::e_Power},
    {k_document_namespace_id, "Sockets", 7, token::e_Sockets},
    {k_document_namespace_id, "Motto", 5, token::e_Motto},
    {k_document_namespace_id, "Lit", 3, token::e_Lit},
};
constexpr frame::names_between k_Lamp_next[] = {{1, 3}, {2, 3}, {3, 4}, {4, 4}};

}  // namespace

// Lamp

Lamp::Lamp() { init(); }
Lamp::Lamp([[maybe_unused]] Lamp const& other) {
    init();
    frame::copy_optional(m_Color, other.m_Color, k_any);
    frame::copy_required(m_Power, other.m_Power, k_any);
    frame::copy_optional(m_Sockets, other.m_Sockets, k_Lamp_Sockets);
    frame::copy_required(m_Motto, other.m_Motto, k_any);
    frame::copy_required(m_Lit, other.m_Lit, k_any);
}
Lamp& Lamp::operator=(Lamp const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Lamp::~Lamp() = default;

void Lamp::swap(Lamp& other) { frame::swap_whole(*this, other); }
void Lamp::make_room_for(Lamp const&) {}
void Lamp::exchange([[maybe_unused]] Lamp& other) noexcept {
    m_Color.swap(other.m_Color);
    m_Power.swap(other.m_Power);
    m_Sockets.swap(other.m_Sockets);
    m_Motto.swap(other.m_Motto);
    m_Lit.swap(other.m_Lit);
}
void Lamp::reset() { frame::reset_by_swap(*this); }
bool Lamp::is_occurs_ok() const { return m_Power.set && m_Motto.set && m_Lit.set; }

void Lamp::init() {
    m_Color.value = L"white";
    m_Power.value = 40.0;
    m_Sockets.value = 1;
    m_Motto.value = L"say \"light\"";
    m_Lit.value = true;
}

qbxV2::eqbx_error Lamp::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Lamp::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

qbxV2::eqbx_error Lamp::marshal(std::ostream& os) const {
    return frame::marshal_to_stream(frame::as_document(*this, "Vrl:Lamp"), os);
}
qbxV2::eqbx_error Lamp::marshal(std::string* text) const {
    return frame::marshal_to_string(frame::as_document(*this, "Vrl:Lamp"), text);
}
qbxV2::eqbx_error Lamp::marshal(char const* path) const {
    return frame::marshal_to_path(frame::as_document(*this, "Vrl:Lamp"), path);
}
qbxV2::eqbx_error Lamp::unmarshal(qbxV2::c_xml_reader& reader) {
    return frame::unmarshal_document(*this, reader, "Lamp", k_source);
}
qbxV2::eqbx_error Lamp::unmarshal(std::string const& text) {
    return frame::unmarshal_memory(*this, text.data(), text.size());
}
qbxV2::eqbx_error Lamp::unmarshal(char const* bytes, unsigned length) {
    return frame::unmarshal_memory(*this, bytes, length);
}
qbxV2::eqbx_error Lamp::unmarshal(char const* path) { return frame::unmarshal_path(*this, path); }
Lamp::Lamp(std::string const& text, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    init();
    *error = unmarshal(text);
}
Lamp::Lamp(char const* bytes, unsigned length, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    init();
    *error = unmarshal(bytes, length);
}
Lamp::Lamp(char const* path, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    init();
    *error = unmarshal(path);
}

std::wstring const& Lamp::get_Color() const { return m_Color.value; }
qbxV2::eqbx_error Lamp::set_Color(std::wstring const& value) { return frame::set(m_Color, value, k_any); }
bool Lamp::isset_Color() const { return m_Color.set; }
void Lamp::unset_Color() { m_Color.set = false; }

double Lamp::get_Power() const { return m_Power.value; }
qbxV2::eqbx_error Lamp::set_Power(double value) { return frame::set(m_Power, value, k_any); }

unsigned int Lamp::get_Sockets() const { return m_Sockets.value; }
qbxV2::eqbx_error Lamp::set_Sockets(unsigned int value) {
    return frame::set(m_Sockets, value, k_Lamp_Sockets);
}
bool Lamp::isset_Sockets() const { return m_Sockets.set; }
void Lamp::unset_Sockets() { m_Sockets.set = false; }

std::wstring const& Lamp::get_Motto() const { return m_Motto.value; }
qbxV2::eqbx_error Lamp::set_Motto(std::wstring const& value) { return frame::set(m_Motto, value, k_any); }

bool Lamp::get_Lit() const { return m_Lit.value; }
qbxV2::eqbx_error Lamp::set_Lit(bool value) { return frame::set(m_Lit, value, k_any); }

bool Lamp::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name,
                                qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_Lamp_attributes);
    switch (in.which()) {
        case 0:
            return in.read(m_Color, k_any);
        default:
            return false;
    }
}

qbxV2::eqbx_error Lamp::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Lamp::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Lamp_children, k_Lamp_next);
    in.begin({0, 1});
    in.required(0, m_Power, k_any);
    in.optional(1, m_Sockets, k_Lamp_Sockets);
    in.required(2, m_Motto, k_any);
    in.required(3, m_Lit, k_any);
    return in.done();
}

void Lamp::marshal_attributes(qbxV2::c_xml_writer& out) const {
    frame::attributes_writer w(out);
    w.if_set(m_Color, "Color");
}

qbxV2::eqbx_error Lamp::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.required(m_Power, "Vrl:Power");
    w.optional(m_Sockets, "Vrl:Sockets");
    w.required(m_Motto, "Vrl:Motto");
    w.required(m_Lit, "Vrl:Lit");
    return w.result();
}

}  // namespace vrl_v2
