// Generated from schema/lists.xsd. To change it, change the schema or V2/frame.
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
constexpr char k_source[] = "V2/lists.cpp";

constexpr frame::no_limits k_any;

// Names, a row each, and which of them may follow at each position.
constexpr qbxV2::s_event_map k_Stop_children[] = {
    {k_document_namespace_id, "Place", 5, token::e_Place},
};
constexpr frame::names_between k_Stop_next[] = {{1, 1}};
constexpr qbxV2::s_event_map k_Journey_children[] = {
    {k_document_namespace_id, "Fare", 4, token::e_Fare},
    {k_document_namespace_id, "Remark", 6, token::e_Remark},
    {k_document_namespace_id, "Stop", 4, token::e_Stop},
    {k_document_namespace_id, "Detour", 6, token::e_Detour},
};
constexpr frame::names_between k_Journey_next[] = {{0, 3}, {1, 3}, {2, 4}, {3, 4}};

}  // namespace

// Stop

Stop::Stop() = default;
Stop::Stop([[maybe_unused]] Stop const& other) {
    frame::copy_required(m_Place, other.m_Place, k_any);
}
Stop& Stop::operator=(Stop const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Stop::~Stop() = default;

void Stop::swap(Stop& other) { frame::swap_whole(*this, other); }
void Stop::make_room_for(Stop const&) {}
void Stop::exchange([[maybe_unused]] Stop& other) noexcept {
    m_Place.swap(other.m_Place);
}
void Stop::reset() { frame::reset_by_swap(*this); }
bool Stop::is_occurs_ok() const { return m_Place.set; }

qbxV2::eqbx_error Stop::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Stop::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

std::wstring const& Stop::get_Place() const { return m_Place.value; }
qbxV2::eqbx_error Stop::set_Place(std::wstring const& value) { return frame::set(m_Place, value, k_any); }

bool Stop::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error Stop::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Stop::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Stop_children, k_Stop_next);
    in.begin({0, 1});
    in.required(0, m_Place, k_any);
    return in.done();
}

void Stop::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Stop::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.required(m_Place, "Vrl:Place");
    return w.result();
}

// Journey

Journey::Journey() = default;
Journey::Journey([[maybe_unused]] Journey const& other) {
    m_Fare.copy_from(other.m_Fare);
    m_Remark.copy_from(other.m_Remark);
    m_Stop.copy_from(other.m_Stop);
    m_Detour.copy_from(other.m_Detour);
}
Journey& Journey::operator=(Journey const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Journey::~Journey() = default;

void Journey::swap(Journey& other) { frame::swap_whole(*this, other); }
void Journey::make_room_for(Journey const&) {}
void Journey::exchange([[maybe_unused]] Journey& other) noexcept {
    m_Fare.swap(other.m_Fare);
    m_Remark.swap(other.m_Remark);
    m_Stop.swap(other.m_Stop);
    m_Detour.swap(other.m_Detour);
}
void Journey::reset() { frame::reset_by_swap(*this); }
bool Journey::is_occurs_ok() const { return !m_Fare.empty() && !m_Stop.empty(); }

qbxV2::eqbx_error Journey::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Journey::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

unsigned Journey::size_Fare() const { return m_Fare.size(); }
double Journey::get_Fare(unsigned i) const { return m_Fare.get(i); }
qbxV2::eqbx_error Journey::set_Fare(unsigned i, double value) { return frame::set(m_Fare, i, value); }
qbxV2::eqbx_error Journey::append_Fare(double value) {
    m_Fare.append(value);
    return qbxV2::EQBX_NO_ERROR;
}
qbxV2::eqbx_error Journey::insert_Fare(unsigned i, double value) {
    m_Fare.insert(i, value);
    return qbxV2::EQBX_NO_ERROR;
}
void Journey::delete_Fare(unsigned i) { m_Fare.erase(i); }
void Journey::clear_Fare() { m_Fare.clear(); }

unsigned Journey::size_Remark() const { return m_Remark.size(); }
std::wstring const& Journey::get_Remark(unsigned i) const { return m_Remark.get(i); }
qbxV2::eqbx_error Journey::set_Remark(unsigned i, std::wstring const& value) {
    return frame::set(m_Remark, i, value);
}
qbxV2::eqbx_error Journey::append_Remark(std::wstring const& value) {
    m_Remark.append(value);
    return qbxV2::EQBX_NO_ERROR;
}
qbxV2::eqbx_error Journey::insert_Remark(unsigned i, std::wstring const& value) {
    m_Remark.insert(i, value);
    return qbxV2::EQBX_NO_ERROR;
}
void Journey::delete_Remark(unsigned i) { m_Remark.erase(i); }
void Journey::clear_Remark() { m_Remark.clear(); }

unsigned Journey::size_Stop() const { return m_Stop.size(); }
Stop const& Journey::get_Stop(unsigned i) const { return m_Stop.get(i); }
Stop& Journey::get_Stop(unsigned i) { return m_Stop.reach(i); }
Stop& Journey::back_Stop() { return m_Stop.back(); }
Stop& Journey::assign_Stop(unsigned i, Stop const& value) {
    frame::assign_by_swap(m_Stop.reach(i), value);
    return m_Stop.reach(i);
}
qbxV2::eqbx_error Journey::append_Stop() {
    m_Stop.append();
    return qbxV2::EQBX_NO_ERROR;
}
qbxV2::eqbx_error Journey::insert_Stop(unsigned i) {
    m_Stop.insert(i);
    return qbxV2::EQBX_NO_ERROR;
}
void Journey::delete_Stop(unsigned i) { m_Stop.erase(i); }
void Journey::clear_Stop() { m_Stop.clear(); }

unsigned Journey::size_Detour() const { return m_Detour.size(); }
Stop const& Journey::get_Detour(unsigned i) const { return m_Detour.get(i); }
Stop& Journey::get_Detour(unsigned i) { return m_Detour.reach(i); }
Stop& Journey::back_Detour() { return m_Detour.back(); }
Stop& Journey::assign_Detour(unsigned i, Stop const& value) {
    frame::assign_by_swap(m_Detour.reach(i), value);
    return m_Detour.reach(i);
}
qbxV2::eqbx_error Journey::append_Detour() {
    m_Detour.append();
    return qbxV2::EQBX_NO_ERROR;
}
qbxV2::eqbx_error Journey::insert_Detour(unsigned i) {
    m_Detour.insert(i);
    return qbxV2::EQBX_NO_ERROR;
}
void Journey::delete_Detour(unsigned i) { m_Detour.erase(i); }
void Journey::clear_Detour() { m_Detour.clear(); }

bool Journey::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error Journey::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Journey::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Journey_children, k_Journey_next);
    in.begin({0, 1});
    in.at_least_one_value(0, m_Fare, k_any);
    in.repeated_values(1, m_Remark, k_any);
    in.at_least_one(2, m_Stop);
    in.repeated(3, m_Detour);
    in.lists_filled(!m_Fare.empty() && !m_Stop.empty(), "Vrl:Journey");
    return in.done();
}

void Journey::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Journey::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.repeated_values(m_Fare, "Vrl:Fare");
    w.repeated_values(m_Remark, "Vrl:Remark");
    w.repeated(m_Stop, "Vrl:Stop");
    w.repeated(m_Detour, "Vrl:Detour");
    return w.result();
}

}  // namespace vrl_v2
