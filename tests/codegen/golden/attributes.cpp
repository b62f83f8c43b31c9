// Generated from schema/attributes.xsd. To change it, change the schema or V2/frame.
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
constexpr char k_source[] = "V2/attributes.cpp";

constexpr frame::no_limits k_any;
constexpr frame::whole k_int{"-2147483648", "2147483647"};
constexpr frame::whole k_FoldingRuler_Links{"0", "255"};

// Names, a row each, and which of them may follow at each position.
constexpr qbxV2::s_event_map k_Ruler_attributes[] = {
    {qbxV2::k_ns_none, "Unit", 4, token::a_Unit},
    {qbxV2::k_ns_none, "Length", 6, token::a_Length},
    {qbxV2::k_ns_none, "Step", 4, token::a_Step},
};
constexpr qbxV2::s_event_map k_FoldingRuler_attributes[] = {
    {qbxV2::k_ns_none, "Links", 5, token::a_Links},
};
constexpr qbxV2::s_event_map k_PaintedRuler_attributes[] = {
    {qbxV2::k_ns_none, "Paint", 5, token::a_Paint},
};

}  // namespace

// Ruler

Ruler::Ruler() { init(); }
Ruler::Ruler([[maybe_unused]] Ruler const& other) {
    init();
    frame::copy_required(m_Unit, other.m_Unit, k_any);
    frame::copy_optional(m_Length, other.m_Length, k_any);
    frame::copy_optional(m_Step, other.m_Step, k_int);
}
Ruler& Ruler::operator=(Ruler const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Ruler::~Ruler() = default;

void Ruler::swap(Ruler& other) { frame::swap_whole(*this, other); }
void Ruler::make_room_for(Ruler const&) {}
void Ruler::exchange([[maybe_unused]] Ruler& other) noexcept {
    m_Unit.swap(other.m_Unit);
    m_Length.swap(other.m_Length);
    m_Step.swap(other.m_Step);
}
void Ruler::reset() { frame::reset_by_swap(*this); }
bool Ruler::is_occurs_ok() const { return m_Unit.set; }

void Ruler::init() {
    m_Step.value = 1;
}

qbxV2::eqbx_error Ruler::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Ruler::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

std::wstring const& Ruler::get_Unit() const { return m_Unit.value; }
qbxV2::eqbx_error Ruler::set_Unit(std::wstring const& value) { return frame::set(m_Unit, value, k_any); }

double Ruler::get_Length() const { return m_Length.value; }
qbxV2::eqbx_error Ruler::set_Length(double value) { return frame::set(m_Length, value, k_any); }
bool Ruler::isset_Length() const { return m_Length.set; }
void Ruler::unset_Length() { m_Length.set = false; }

int Ruler::get_Step() const { return m_Step.value; }
qbxV2::eqbx_error Ruler::set_Step(int value) { return frame::set(m_Step, value, k_int); }
bool Ruler::isset_Step() const { return m_Step.set; }
void Ruler::unset_Step() { m_Step.set = false; }

bool Ruler::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name,
                                 qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_Ruler_attributes);
    switch (in.which()) {
        case 0:
            return in.read(m_Unit, k_any);
        case 1:
            return in.read(m_Length, k_any);
        case 2:
            return in.read(m_Step, k_int);
        default:
            return false;
    }
}

qbxV2::eqbx_error Ruler::unmarshal_attributes_check(qbxV2::c_xml_reader& reader) {
    frame::required_attributes check(reader, k_source);
    check.need(m_Unit, "Unit");
    return check.result();
}

bool Ruler::unmarshal_body(qbxV2::c_xml_reader&, std::string*, qbxV2::eqbx_error*) { return true; }

void Ruler::marshal_attributes(qbxV2::c_xml_writer& out) const {
    frame::attributes_writer w(out);
    w.if_set(m_Unit, "Unit");
    w.if_set(m_Length, "Length");
    w.always(m_Step, "Step");
}

qbxV2::eqbx_error Ruler::marshal_child_elements(qbxV2::c_xml_writer&) const { return qbxV2::EQBX_NO_ERROR; }

// FoldingRuler

FoldingRuler::FoldingRuler() = default;
FoldingRuler::FoldingRuler([[maybe_unused]] FoldingRuler const& other) : Ruler(other) {
    frame::copy_required(m_Links, other.m_Links, k_FoldingRuler_Links);
}
FoldingRuler& FoldingRuler::operator=(FoldingRuler const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
FoldingRuler::~FoldingRuler() = default;

void FoldingRuler::swap(FoldingRuler& other) { frame::swap_whole(*this, other); }
void FoldingRuler::make_room_for(FoldingRuler const& other) {
    Ruler::make_room_for(other);
}
void FoldingRuler::exchange([[maybe_unused]] FoldingRuler& other) noexcept {
    Ruler::exchange(other);
    m_Links.swap(other.m_Links);
}
void FoldingRuler::reset() { frame::reset_by_swap(*this); }
bool FoldingRuler::is_occurs_ok() const { return Ruler::is_occurs_ok() && m_Links.set; }

qbxV2::eqbx_error FoldingRuler::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error FoldingRuler::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

unsigned char FoldingRuler::get_Links() const { return m_Links.value; }
qbxV2::eqbx_error FoldingRuler::set_Links(unsigned char value) {
    return frame::set(m_Links, value, k_FoldingRuler_Links);
}

bool FoldingRuler::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name,
                                        qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_FoldingRuler_attributes);
    switch (in.which()) {
        case 0:
            return in.read(m_Links, k_FoldingRuler_Links);
        default:
            return Ruler::unmarshal_attributes(reader, name, error);
    }
}

qbxV2::eqbx_error FoldingRuler::unmarshal_attributes_check(qbxV2::c_xml_reader& reader) {
    const qbxV2::eqbx_error missing = Ruler::unmarshal_attributes_check(reader);
    if (missing != qbxV2::EQBX_NO_ERROR) return missing;
    frame::required_attributes check(reader, k_source);
    check.need(m_Links, "Links");
    return check.result();
}

void FoldingRuler::marshal_attributes(qbxV2::c_xml_writer& out) const {
    Ruler::marshal_attributes(out);
    frame::attributes_writer w(out);
    w.if_set(m_Links, "Links");
}

// PaintedRuler

PaintedRuler::PaintedRuler() = default;
PaintedRuler::PaintedRuler([[maybe_unused]] PaintedRuler const& other) : Ruler(other) {
    frame::copy_optional(m_Paint, other.m_Paint, k_any);
}
PaintedRuler& PaintedRuler::operator=(PaintedRuler const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
PaintedRuler::~PaintedRuler() = default;

void PaintedRuler::swap(PaintedRuler& other) { frame::swap_whole(*this, other); }
void PaintedRuler::make_room_for(PaintedRuler const& other) {
    Ruler::make_room_for(other);
}
void PaintedRuler::exchange([[maybe_unused]] PaintedRuler& other) noexcept {
    Ruler::exchange(other);
    m_Paint.swap(other.m_Paint);
}
void PaintedRuler::reset() { frame::reset_by_swap(*this); }
bool PaintedRuler::is_occurs_ok() const { return Ruler::is_occurs_ok(); }

qbxV2::eqbx_error PaintedRuler::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error PaintedRuler::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

std::wstring const& PaintedRuler::get_Paint() const { return m_Paint.value; }
qbxV2::eqbx_error PaintedRuler::set_Paint(std::wstring const& value) {
    return frame::set(m_Paint, value, k_any);
}
bool PaintedRuler::isset_Paint() const { return m_Paint.set; }
void PaintedRuler::unset_Paint() { m_Paint.set = false; }

bool PaintedRuler::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name,
                                        qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_PaintedRuler_attributes);
    switch (in.which()) {
        case 0:
            return in.read(m_Paint, k_any);
        default:
            return Ruler::unmarshal_attributes(reader, name, error);
    }
}

qbxV2::eqbx_error PaintedRuler::unmarshal_attributes_check(qbxV2::c_xml_reader& reader) {
    return Ruler::unmarshal_attributes_check(reader);
}

void PaintedRuler::marshal_attributes(qbxV2::c_xml_writer& out) const {
    Ruler::marshal_attributes(out);
    frame::attributes_writer w(out);
    w.if_set(m_Paint, "Paint");
}

}  // namespace vrl_v2
