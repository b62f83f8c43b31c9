// Generated from schema/any.xsd. To change it, change the schema or V2/frame.
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
constexpr char k_source[] = "V2/any.cpp";

// Names, a row each, and which of them may follow at each position.
constexpr qbxV2::s_event_map k_Attic_children[] = {
    {k_document_namespace_id, "Box", 3, token::e_Box},
};
constexpr frame::names_between k_Attic_next[] = {{1, 1}};

}  // namespace

// Box

Box::Box() = default;
Box::Box([[maybe_unused]] Box const& other) {
    m_any.copy_from(other.m_any);
}
Box& Box::operator=(Box const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Box::~Box() = default;

void Box::swap(Box& other) { frame::swap_whole(*this, other); }
void Box::make_room_for(Box const&) {}
void Box::exchange([[maybe_unused]] Box& other) noexcept {
    m_any.swap(other.m_any);
}
void Box::reset() { frame::reset_by_swap(*this); }
bool Box::is_occurs_ok() const { return !m_any.empty(); }

qbxV2::eqbx_error Box::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {});
}
qbxV2::eqbx_error Box::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

unsigned Box::size_any() const { return m_any.size(); }
void Box::get_any(unsigned i, std::string* ns, std::string* name, std::string* value) const {
    const qbxV2::c_any_info& entry = m_any.get(i);
    if (ns != nullptr) *ns = entry.get_namespace();
    if (name != nullptr) *name = entry.get_name();
    *value = entry.get_value();
}
qbxV2::eqbx_error Box::append_any(std::string const& value) { return insert_any(m_any.size(), value); }
qbxV2::eqbx_error Box::insert_any(unsigned i, std::string const& value) {
    m_any.insert(i, qbxV2::c_any_info("", "", value));
    return qbxV2::EQBX_NO_ERROR;
}
void Box::delete_any(unsigned i) { m_any.erase(i); }
void Box::clear_any() { m_any.clear(); }

bool Box::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) { return false; }

qbxV2::eqbx_error Box::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Box::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::any_reader in(reader, name, error, k_source);
    in.read(m_any);
    return in.done();
}

void Box::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Box::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    for (const qbxV2::c_any_info* entry : m_any) w.raw(entry->get_value());
    return w.result();
}

// Attic

Attic::Attic() = default;
Attic::Attic([[maybe_unused]] Attic const& other) {
    frame::copy_optional(m_Box, other.m_Box);
}
Attic& Attic::operator=(Attic const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Attic::~Attic() = default;

void Attic::swap(Attic& other) { frame::swap_whole(*this, other); }
void Attic::make_room_for(Attic const& other) {
    m_Box.make_room_for(other.m_Box);
}
void Attic::exchange([[maybe_unused]] Attic& other) noexcept {
    m_Box.exchange(other.m_Box);
}
void Attic::reset() { frame::reset_by_swap(*this); }
bool Attic::is_occurs_ok() const { return true; }

qbxV2::eqbx_error Attic::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Attic::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

Box const& Attic::get_Box() const { return m_Box.get(); }
Box& Attic::get_Box() { return m_Box.get(); }
Box& Attic::assign_Box(Box const& value) { return m_Box.assign(value); }
bool Attic::isset_Box() const { return m_Box.is_set(); }
void Attic::unset_Box() { m_Box.unset(); }

bool Attic::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error Attic::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Attic::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Attic_children, k_Attic_next);
    in.begin({0, 1});
    in.optional(0, m_Box);
    return in.done();
}

void Attic::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Attic::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.optional(m_Box, "Vrl:Box");
    return w.result();
}

}  // namespace vrl_v2
