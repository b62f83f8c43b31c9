// Generated from schema/polymorphic.xsd. To change it, change the schema or V2/frame.
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
constexpr char k_source[] = "V2/polymorphic.cpp";

constexpr frame::whole k_int{"-2147483648", "2147483647"};
constexpr frame::no_limits k_any;

// Names, a row each, and which of them may follow at each position.
constexpr qbxV2::s_event_map k_AnimalType_attributes[] = {
    {qbxV2::k_ns_none, "Tag", 3, token::a_Tag},
};
constexpr qbxV2::s_event_map k_AnimalType_children[] = {
    {k_document_namespace_id, "Name", 4, token::e_Name},
};
constexpr frame::names_between k_AnimalType_next[] = {{1, 1}};
constexpr qbxV2::s_event_map k_BirdType_children[] = {
    {k_document_namespace_id, "Span", 4, token::e_Span},
};
constexpr frame::names_between k_BirdType_next[] = {{1, 1}};

}  // namespace

// AnimalType

AnimalType::AnimalType() = default;
AnimalType::AnimalType([[maybe_unused]] AnimalType const& other) {
    frame::copy_optional(m_Tag, other.m_Tag, k_int);
    frame::copy_required(m_Name, other.m_Name, k_any);
}
AnimalType& AnimalType::operator=(AnimalType const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
AnimalType::~AnimalType() = default;

void AnimalType::swap(AnimalType& other) { frame::swap_whole(*this, other); }
void AnimalType::make_room_for(AnimalType const&) {}
void AnimalType::exchange([[maybe_unused]] AnimalType& other) noexcept {
    m_Tag.swap(other.m_Tag);
    m_Name.swap(other.m_Name);
}
void AnimalType::reset() { frame::reset_by_swap(*this); }
bool AnimalType::is_occurs_ok() const { return m_Name.set; }

namespace {
constexpr char k_AnimalType_id[] = "AnimalType";
}  // namespace
char const* AnimalType::id = k_AnimalType_id;
AnimalType* AnimalType::clone() const { return new AnimalType(*this); }
char const* AnimalType::getid() const { return id; }
bool AnimalType::has_id(char const* identity) const { return identity == id; }

namespace {
constexpr frame::family_member<AnimalType> k_AnimalType_family[] = {
    {&BirdType::id, &frame::make<AnimalType, BirdType>},
    {&OwlType::id, &frame::make<AnimalType, OwlType>},
};
}  // namespace
AnimalType* AnimalType::factory(int ns_id, std::string const& type_name) {
    return frame::make_by_name(k_AnimalType_family, ns_id, type_name);
}

qbxV2::eqbx_error AnimalType::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name,
                          {.declares_namespaces = true, .id = AnimalType::id, .xsi_type = "Vrl:AnimalType"});
}
qbxV2::eqbx_error AnimalType::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

int AnimalType::get_Tag() const { return m_Tag.value; }
qbxV2::eqbx_error AnimalType::set_Tag(int value) { return frame::set(m_Tag, value, k_int); }
bool AnimalType::isset_Tag() const { return m_Tag.set; }
void AnimalType::unset_Tag() { m_Tag.set = false; }

std::wstring const& AnimalType::get_Name() const { return m_Name.value; }
qbxV2::eqbx_error AnimalType::set_Name(std::wstring const& value) { return frame::set(m_Name, value, k_any); }

bool AnimalType::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name,
                                      qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_AnimalType_attributes);
    switch (in.which()) {
        case 0:
            return in.read(m_Tag, k_int);
        default:
            return false;
    }
}

qbxV2::eqbx_error AnimalType::unmarshal_attributes_check(qbxV2::c_xml_reader&) {
    return qbxV2::EQBX_NO_ERROR;
}

bool AnimalType::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_AnimalType_children, k_AnimalType_next);
    in.begin({0, 1});
    in.required(0, m_Name, k_any);
    return in.done();
}

void AnimalType::marshal_attributes(qbxV2::c_xml_writer& out) const {
    frame::attributes_writer w(out);
    w.if_set(m_Tag, "Tag");
}

qbxV2::eqbx_error AnimalType::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.required(m_Name, "Vrl:Name");
    return w.result();
}

// BirdType

BirdType::BirdType() = default;
BirdType::BirdType([[maybe_unused]] BirdType const& other) : AnimalType(other) {
    frame::copy_optional(m_Span, other.m_Span, k_any);
}
BirdType& BirdType::operator=(BirdType const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
BirdType::~BirdType() = default;

void BirdType::swap(BirdType& other) { frame::swap_whole(*this, other); }
void BirdType::make_room_for(BirdType const& other) {
    AnimalType::make_room_for(other);
}
void BirdType::exchange([[maybe_unused]] BirdType& other) noexcept {
    AnimalType::exchange(other);
    m_Span.swap(other.m_Span);
}
void BirdType::reset() { frame::reset_by_swap(*this); }
bool BirdType::is_occurs_ok() const { return AnimalType::is_occurs_ok(); }

namespace {
constexpr char k_BirdType_id[] = "BirdType";
}  // namespace
char const* BirdType::id = k_BirdType_id;
BirdType* BirdType::clone() const { return new BirdType(*this); }
char const* BirdType::getid() const { return id; }
bool BirdType::has_id(char const* identity) const { return identity == id || AnimalType::has_id(identity); }

namespace {
constexpr frame::family_member<BirdType> k_BirdType_family[] = {
    {&OwlType::id, &frame::make<BirdType, OwlType>},
};
}  // namespace
BirdType* BirdType::factory(int ns_id, std::string const& type_name) {
    return frame::make_by_name(k_BirdType_family, ns_id, type_name);
}

qbxV2::eqbx_error BirdType::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name,
                          {.declares_namespaces = true, .id = BirdType::id, .xsi_type = "Vrl:BirdType"});
}
qbxV2::eqbx_error BirdType::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

double BirdType::get_Span() const { return m_Span.value; }
qbxV2::eqbx_error BirdType::set_Span(double value) { return frame::set(m_Span, value, k_any); }
bool BirdType::isset_Span() const { return m_Span.set; }
void BirdType::unset_Span() { m_Span.set = false; }

bool BirdType::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    if (!AnimalType::unmarshal_body(reader, name, error)) return false;
    frame::children_reader in(reader, name, error, k_source, k_BirdType_children, k_BirdType_next);
    in.begin_derived({0, 1});
    in.optional(0, m_Span, k_any);
    return in.done();
}

qbxV2::eqbx_error BirdType::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out, AnimalType::marshal_child_elements(out));
    w.optional(m_Span, "Vrl:Span");
    return w.result();
}

// OwlType

OwlType::OwlType() = default;
OwlType::OwlType([[maybe_unused]] OwlType const& other) : BirdType(other) {
}
OwlType& OwlType::operator=(OwlType const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
OwlType::~OwlType() = default;

void OwlType::swap(OwlType& other) { frame::swap_whole(*this, other); }
void OwlType::make_room_for(OwlType const& other) {
    BirdType::make_room_for(other);
}
void OwlType::exchange([[maybe_unused]] OwlType& other) noexcept {
    BirdType::exchange(other);
}
void OwlType::reset() { frame::reset_by_swap(*this); }
bool OwlType::is_occurs_ok() const { return BirdType::is_occurs_ok(); }

namespace {
constexpr char k_OwlType_id[] = "OwlType";
}  // namespace
char const* OwlType::id = k_OwlType_id;
OwlType* OwlType::clone() const { return new OwlType(*this); }
char const* OwlType::getid() const { return id; }
bool OwlType::has_id(char const* identity) const { return identity == id || BirdType::has_id(identity); }

qbxV2::eqbx_error OwlType::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name,
                          {.declares_namespaces = true, .id = OwlType::id, .xsi_type = "Vrl:OwlType"});
}
qbxV2::eqbx_error OwlType::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source, .accepts_empty = true};
    return frame::unmarshal(*this, kind, reader, name);
}

// Owl

Owl::Owl() = default;
Owl::Owl(Owl const& other) = default;
Owl& Owl::operator=(Owl const& other) = default;
Owl::~Owl() = default;
qbxV2::eqbx_error Owl::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    out.conditionally_select_ns_map(document_namespaces());
    return OwlType::marshal(out, name);
}
qbxV2::eqbx_error Owl::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    return OwlType::unmarshal(reader, name);
}

qbxV2::eqbx_error Owl::marshal(std::ostream& os) const {
    return frame::marshal_to_stream(frame::as_document(*this, "Vrl:Owl"), os);
}
qbxV2::eqbx_error Owl::marshal(std::string* text) const {
    return frame::marshal_to_string(frame::as_document(*this, "Vrl:Owl"), text);
}
qbxV2::eqbx_error Owl::marshal(char const* path) const {
    return frame::marshal_to_path(frame::as_document(*this, "Vrl:Owl"), path);
}
qbxV2::eqbx_error Owl::unmarshal(qbxV2::c_xml_reader& reader) {
    return frame::unmarshal_document(*this, reader, "Owl", k_source);
}
qbxV2::eqbx_error Owl::unmarshal(std::string const& text) {
    return frame::unmarshal_memory(*this, text.data(), text.size());
}
qbxV2::eqbx_error Owl::unmarshal(char const* bytes, unsigned length) {
    return frame::unmarshal_memory(*this, bytes, length);
}
qbxV2::eqbx_error Owl::unmarshal(char const* path) { return frame::unmarshal_path(*this, path); }
Owl::Owl(std::string const& text, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(text);
}
Owl::Owl(char const* bytes, unsigned length, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(bytes, length);
}
Owl::Owl(char const* path, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(path);
}

}  // namespace vrl_v2
