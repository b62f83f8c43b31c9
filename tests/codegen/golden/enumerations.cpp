// Generated from schema/enumerations.xsd. To change it, change the schema or V2/frame.
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
constexpr char k_source[] = "V2/enumerations.cpp";

constexpr std::wstring_view k_SizeKind_texts[] = {L"Small", L"Medium", L"Extra-Large"};
constexpr frame::literals k_SizeKind(k_SizeKind_texts);
constexpr std::wstring_view k_Shirt_Fabric_texts[] = {L"Cotton", L"Flax"};
constexpr frame::literals k_Shirt_Fabric(k_Shirt_Fabric_texts);
constexpr frame::no_limits k_any;

// Names, a row each, and which of them may follow at each position.
constexpr qbxV2::s_event_map k_Shirt_attributes[] = {
    {qbxV2::k_ns_none, "Size", 4, token::a_Size},
};
constexpr qbxV2::s_event_map k_Shirt_children[] = {
    {k_document_namespace_id, "Fabric", 6, token::e_Fabric},
};
constexpr frame::names_between k_Shirt_next[] = {{1, 1}};
constexpr qbxV2::s_event_map k_Measure_children[] = {
    {k_document_namespace_id, "Size", 4, token::e_Size},
    {k_document_namespace_id, "Girth", 5, token::e_Girth},
};
constexpr frame::names_between k_Measure_next[] = {{0, 2}, {0, 2}};

}  // namespace

// Shirt

Shirt::Shirt() = default;
Shirt::Shirt([[maybe_unused]] Shirt const& other) {
    frame::copy_required(m_Size, other.m_Size, k_SizeKind);
    frame::copy_required(m_Fabric, other.m_Fabric, k_Shirt_Fabric);
}
Shirt& Shirt::operator=(Shirt const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Shirt::~Shirt() = default;

void Shirt::swap(Shirt& other) { frame::swap_whole(*this, other); }
void Shirt::make_room_for(Shirt const&) {}
void Shirt::exchange([[maybe_unused]] Shirt& other) noexcept {
    m_Size.swap(other.m_Size);
    m_Fabric.swap(other.m_Fabric);
}
void Shirt::reset() { frame::reset_by_swap(*this); }
bool Shirt::is_occurs_ok() const { return m_Size.set && m_Fabric.set; }

qbxV2::eqbx_error Shirt::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Shirt::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

std::wstring const& Shirt::get_Size() const { return m_Size.value; }
qbxV2::eqbx_error Shirt::set_Size(std::wstring const& value) { return frame::set(m_Size, value, k_SizeKind); }
Shirt::Eenum_Size Shirt::getenum_Size() const {
    return static_cast<Eenum_Size>(k_SizeKind.number_of(get_Size()));
}
bool Shirt::setenum_Size(Eenum_Size value) {
    const std::wstring_view* text = k_SizeKind.text_of(value);
    return text != nullptr && set_Size(std::wstring(*text)) == qbxV2::EQBX_NO_ERROR;
}

std::wstring const& Shirt::get_Fabric() const { return m_Fabric.value; }
qbxV2::eqbx_error Shirt::set_Fabric(std::wstring const& value) {
    return frame::set(m_Fabric, value, k_Shirt_Fabric);
}
Shirt::Eenum_Fabric Shirt::getenum_Fabric() const {
    return static_cast<Eenum_Fabric>(k_Shirt_Fabric.number_of(get_Fabric()));
}
bool Shirt::setenum_Fabric(Eenum_Fabric value) {
    const std::wstring_view* text = k_Shirt_Fabric.text_of(value);
    return text != nullptr && set_Fabric(std::wstring(*text)) == qbxV2::EQBX_NO_ERROR;
}

bool Shirt::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name,
                                 qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_Shirt_attributes);
    switch (in.which()) {
        case 0:
            return in.read(m_Size, k_SizeKind);
        default:
            return false;
    }
}

qbxV2::eqbx_error Shirt::unmarshal_attributes_check(qbxV2::c_xml_reader& reader) {
    frame::required_attributes check(reader, k_source);
    check.need(m_Size, "Size");
    return check.result();
}

bool Shirt::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Shirt_children, k_Shirt_next);
    in.begin({0, 1});
    in.required(0, m_Fabric, k_Shirt_Fabric);
    return in.done();
}

void Shirt::marshal_attributes(qbxV2::c_xml_writer& out) const {
    frame::attributes_writer w(out);
    w.if_set(m_Size, "Size");
}

qbxV2::eqbx_error Shirt::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.required(m_Fabric, "Vrl:Fabric");
    return w.result();
}

// Sleeve

Sleeve::Sleeve() = default;
Sleeve::Sleeve([[maybe_unused]] Sleeve const& other) {
    frame::copy_required(m_Sleeve, other.m_Sleeve, k_SizeKind);
}
Sleeve& Sleeve::operator=(Sleeve const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Sleeve::~Sleeve() = default;

void Sleeve::swap(Sleeve& other) { frame::swap_whole(*this, other); }
void Sleeve::make_room_for(Sleeve const&) {}
void Sleeve::exchange([[maybe_unused]] Sleeve& other) noexcept {
    m_Sleeve.swap(other.m_Sleeve);
}
void Sleeve::reset() { frame::reset_by_swap(*this); }
bool Sleeve::is_occurs_ok() const { return m_Sleeve.set; }

qbxV2::eqbx_error Sleeve::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true, .has_text_only = true});
}
qbxV2::eqbx_error Sleeve::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source, .has_text_only = true};
    return frame::unmarshal(*this, kind, reader, name);
}

std::wstring const& Sleeve::get_Sleeve() const { return m_Sleeve.value; }
qbxV2::eqbx_error Sleeve::set_Sleeve(std::wstring const& value) {
    return frame::set(m_Sleeve, value, k_SizeKind);
}
Sleeve::Eenum_Sleeve Sleeve::getenum_Sleeve() const {
    return static_cast<Eenum_Sleeve>(k_SizeKind.number_of(get_Sleeve()));
}
bool Sleeve::setenum_Sleeve(Eenum_Sleeve value) {
    const std::wstring_view* text = k_SizeKind.text_of(value);
    return text != nullptr && set_Sleeve(std::wstring(*text)) == qbxV2::EQBX_NO_ERROR;
}

bool Sleeve::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error Sleeve::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Sleeve::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error,
                            bool has_content) {
    frame::text_reader in(reader, *name, error, k_source);
    return in.read(m_Sleeve, k_SizeKind, has_content);
}

void Sleeve::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Sleeve::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    if (m_Sleeve.set) frame::put_value(out, m_Sleeve.value);
    return qbxV2::EQBX_NO_ERROR;
}

// Measure

Measure::Measure() = default;
Measure::Measure([[maybe_unused]] Measure const& other) {
    if (other.m_chosen == chosen_Size) set_Size(other.get_Size());
    if (other.m_chosen == chosen_Girth) set_Girth(other.get_Girth());
}
Measure& Measure::operator=(Measure const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Measure::~Measure() = default;

void Measure::swap(Measure& other) { frame::swap_whole(*this, other); }
void Measure::make_room_for(Measure const&) {}
void Measure::exchange([[maybe_unused]] Measure& other) noexcept {
    std::swap(m_chosen, other.m_chosen);
    m_Size.swap(other.m_Size);
    m_Girth.swap(other.m_Girth);
}
void Measure::reset() { frame::reset_by_swap(*this); }
bool Measure::is_occurs_ok() const { return m_chosen != chosen_none; }

void Measure::choose(eqbx_chosen option) {
    if (m_chosen == option) return;
    release_choice();
    m_chosen = option;
}

void Measure::release_choice() {
    m_Size.release();
    m_Girth.release();
    m_chosen = chosen_none;
}

qbxV2::eqbx_error Measure::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Measure::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

std::wstring const& Measure::get_Size() const { return m_Size.get(); }
// Intended: the choice moves before the value is checked.
qbxV2::eqbx_error Measure::set_Size(std::wstring const& value) {
    choose(chosen_Size);
    std::wstring& stored = m_Size.get();
    const qbxV2::eqbx_error refused = k_SizeKind.check(value);
    if (refused == qbxV2::EQBX_NO_ERROR) stored = value;
    return refused;
}
Measure::Eenum_Size Measure::getenum_Size() const {
    return static_cast<Eenum_Size>(k_SizeKind.number_of(get_Size()));
}
bool Measure::setenum_Size(Eenum_Size value) {
    const std::wstring_view* text = k_SizeKind.text_of(value);
    return text != nullptr && set_Size(std::wstring(*text)) == qbxV2::EQBX_NO_ERROR;
}

double Measure::get_Girth() const { return m_Girth.get(); }
// Intended: the choice moves before the value is checked.
qbxV2::eqbx_error Measure::set_Girth(double value) {
    choose(chosen_Girth);
    double& stored = m_Girth.get();
    const qbxV2::eqbx_error refused = k_any.check(value);
    if (refused == qbxV2::EQBX_NO_ERROR) stored = value;
    return refused;
}

bool Measure::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error Measure::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Measure::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Measure_children, k_Measure_next);
    in.begin({0, 2});
    switch (in.which()) {
        case 0:
            choose(chosen_Size);
            in.option_value(m_Size.get(), k_SizeKind);
            break;
        case 1:
            choose(chosen_Girth);
            in.option_value(m_Girth.get(), k_any);
            break;
        default:
            in.no_option();
            break;
    }
    return in.done();
}

void Measure::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Measure::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    switch (m_chosen) {
        case chosen_Size:
            w.value(m_Size.get(), "Vrl:Size");
            break;
        case chosen_Girth:
            w.value(m_Girth.get(), "Vrl:Girth");
            break;
        default:
            return out.handle_error(qbxV2::EQBX_BAD_CHOICE, "Vrl:Measure", k_source, __LINE__);
    }
    return w.result();
}

}  // namespace vrl_v2
