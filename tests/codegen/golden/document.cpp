// Generated from schema/document.xsd. To change it, change the schema or V2/frame.
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
constexpr char k_source[] = "V2/document.cpp";

constexpr frame::no_limits k_any;

// Names, a row each, and which of them may follow at each position.
constexpr qbxV2::s_event_map k_Vrl_children[] = {
    {k_document_namespace_id, "Title", 5, token::e_Title},
};
constexpr frame::names_between k_Vrl_next[] = {{1, 1}};

}  // namespace

// Vrl

Vrl::Vrl() { init(); }
Vrl::Vrl([[maybe_unused]] Vrl const& other) {
    init();
    frame::copy_optional(m_Title, other.m_Title, k_any);
}
Vrl& Vrl::operator=(Vrl const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Vrl::~Vrl() = default;

void Vrl::swap(Vrl& other) { frame::swap_whole(*this, other); }
void Vrl::make_room_for(Vrl const&) {}
void Vrl::exchange([[maybe_unused]] Vrl& other) noexcept {
    m_Title.swap(other.m_Title);
}
void Vrl::reset() { frame::reset_by_swap(*this); }
bool Vrl::is_occurs_ok() const { return true; }

qbxV2::eqbx_error Vrl::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Vrl::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

qbxV2::eqbx_error Vrl::marshal(std::ostream& os) const {
    return frame::marshal_to_stream(frame::as_document(*this, "Vrl:Vrl"), os);
}
qbxV2::eqbx_error Vrl::marshal(std::string* text) const {
    return frame::marshal_to_string(frame::as_document(*this, "Vrl:Vrl"), text);
}
qbxV2::eqbx_error Vrl::marshal(char const* path) const {
    return frame::marshal_to_path(frame::as_document(*this, "Vrl:Vrl"), path);
}
qbxV2::eqbx_error Vrl::unmarshal(qbxV2::c_xml_reader& reader) {
    return frame::unmarshal_document(*this, reader, "Vrl", k_source);
}
qbxV2::eqbx_error Vrl::unmarshal(std::string const& text) {
    return frame::unmarshal_memory(*this, text.data(), text.size());
}
qbxV2::eqbx_error Vrl::unmarshal(char const* bytes, unsigned length) {
    return frame::unmarshal_memory(*this, bytes, length);
}
qbxV2::eqbx_error Vrl::unmarshal(char const* path) { return frame::unmarshal_path(*this, path); }
Vrl::Vrl(std::string const& text, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    init();
    *error = unmarshal(text);
}
Vrl::Vrl(char const* bytes, unsigned length, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    init();
    *error = unmarshal(bytes, length);
}
Vrl::Vrl(char const* path, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    init();
    *error = unmarshal(path);
}

std::wstring const& Vrl::get_Title() const { return m_Title.value; }
qbxV2::eqbx_error Vrl::set_Title(std::wstring const& value) { return frame::set(m_Title, value, k_any); }
bool Vrl::isset_Title() const { return m_Title.set; }
void Vrl::unset_Title() { m_Title.set = false; }

bool Vrl::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) { return false; }

qbxV2::eqbx_error Vrl::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Vrl::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Vrl_children, k_Vrl_next);
    in.begin({0, 1});
    in.optional(0, m_Title, k_any);
    return in.done();
}

void Vrl::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Vrl::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.optional(m_Title, "Vrl:Title");
    return w.result();
}

}  // namespace vrl_v2
