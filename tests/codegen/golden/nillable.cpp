// Generated from schema/nillable.xsd. To change it, change the schema or V2/frame.
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
constexpr char k_source[] = "V2/nillable.cpp";

constexpr frame::no_limits k_any;

// Names, a row each, and which of them may follow at each position.
constexpr qbxV2::s_event_map k_CatType_children[] = {
    {k_document_namespace_id, "Name", 4, token::e_Name},
};
constexpr frame::names_between k_CatType_next[] = {{1, 1}};
constexpr qbxV2::s_event_map k_CallType_attributes[] = {
    {qbxV2::k_ns_none, "Pitch", 5, token::a_Pitch},
};
constexpr qbxV2::s_event_map k_Mouse_attributes[] = {
    {qbxV2::k_ns_xsi, "nil", 3, qbxV2::EQXP_XSI_NIL},
};
constexpr qbxV2::s_event_map k_Mouse_children[] = {
    {k_document_namespace_id, "Hole", 4, token::e_Hole},
    {k_document_namespace_id, "Cheese", 6, token::e_Cheese},
};
constexpr frame::names_between k_Mouse_next[] = {{1, 2}, {2, 2}};
constexpr qbxV2::s_event_map k_Sign_attributes[] = {
    {qbxV2::k_ns_xsi, "nil", 3, qbxV2::EQXP_XSI_NIL},
};
constexpr qbxV2::s_event_map k_House_children[] = {
    {k_document_namespace_id, "Cat", 3, token::e_Cat},
    {k_document_namespace_id, "Call", 4, token::e_Call},
    {k_document_namespace_id, "Mouse", 5, token::e_Mouse},
    {k_document_namespace_id, "Sign", 4, token::e_Sign},
};
constexpr frame::names_between k_House_next[] = {{1, 2}, {2, 3}, {3, 4}, {4, 4}};
constexpr qbxV2::s_event_map k_Stray_attributes[] = {
    {qbxV2::k_ns_xsi, "nil", 3, qbxV2::EQXP_XSI_NIL},
};
constexpr qbxV2::s_event_map k_Call_attributes[] = {
    {qbxV2::k_ns_xsi, "nil", 3, qbxV2::EQXP_XSI_NIL},
};
constexpr qbxV2::s_event_map k_Cat_attributes[] = {
    {qbxV2::k_ns_xsi, "nil", 3, qbxV2::EQXP_XSI_NIL},
};

}  // namespace

// CatType

CatType::CatType() = default;
CatType::CatType([[maybe_unused]] CatType const& other) {
    frame::copy_required(m_Name, other.m_Name, k_any);
}
CatType& CatType::operator=(CatType const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
CatType::~CatType() = default;

void CatType::swap(CatType& other) { frame::swap_whole(*this, other); }
void CatType::make_room_for(CatType const&) {}
void CatType::exchange([[maybe_unused]] CatType& other) noexcept {
    m_Name.swap(other.m_Name);
}
void CatType::reset() { frame::reset_by_swap(*this); }
bool CatType::is_occurs_ok() const { return m_Name.set; }

qbxV2::eqbx_error CatType::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error CatType::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

std::wstring const& CatType::get_Name() const { return m_Name.value; }
qbxV2::eqbx_error CatType::set_Name(std::wstring const& value) { return frame::set(m_Name, value, k_any); }

bool CatType::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error CatType::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool CatType::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_CatType_children, k_CatType_next);
    in.begin({0, 1});
    in.required(0, m_Name, k_any);
    return in.done();
}

void CatType::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error CatType::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.required(m_Name, "Vrl:Name");
    return w.result();
}

// CallType

CallType::CallType() = default;
CallType::CallType([[maybe_unused]] CallType const& other) {
    frame::copy_required(m_Pitch, other.m_Pitch, k_any);
    frame::copy_required(m_CallType, other.m_CallType, k_any);
}
CallType& CallType::operator=(CallType const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
CallType::~CallType() = default;

void CallType::swap(CallType& other) { frame::swap_whole(*this, other); }
void CallType::make_room_for(CallType const&) {}
void CallType::exchange([[maybe_unused]] CallType& other) noexcept {
    m_Pitch.swap(other.m_Pitch);
    m_CallType.swap(other.m_CallType);
}
void CallType::reset() { frame::reset_by_swap(*this); }
bool CallType::is_occurs_ok() const { return m_Pitch.set && m_CallType.set; }

qbxV2::eqbx_error CallType::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true, .has_text_only = true});
}
qbxV2::eqbx_error CallType::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source, .has_text_only = true};
    return frame::unmarshal(*this, kind, reader, name);
}

double CallType::get_Pitch() const { return m_Pitch.value; }
qbxV2::eqbx_error CallType::set_Pitch(double value) { return frame::set(m_Pitch, value, k_any); }

std::wstring const& CallType::get_CallType() const { return m_CallType.value; }
qbxV2::eqbx_error CallType::set_CallType(std::wstring const& value) {
    return frame::set(m_CallType, value, k_any);
}

bool CallType::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name,
                                    qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_CallType_attributes);
    switch (in.which()) {
        case 0:
            return in.read(m_Pitch, k_any);
        default:
            return false;
    }
}

qbxV2::eqbx_error CallType::unmarshal_attributes_check(qbxV2::c_xml_reader& reader) {
    frame::required_attributes check(reader, k_source);
    check.need(m_Pitch, "Pitch");
    return check.result();
}

bool CallType::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error,
                              bool has_content) {
    frame::text_reader in(reader, *name, error, k_source);
    return in.read(m_CallType, k_any, has_content);
}

void CallType::marshal_attributes(qbxV2::c_xml_writer& out) const {
    frame::attributes_writer w(out);
    w.if_set(m_Pitch, "Pitch");
}

qbxV2::eqbx_error CallType::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    if (m_CallType.set) frame::put_value(out, m_CallType.value);
    return qbxV2::EQBX_NO_ERROR;
}

// Mouse

Mouse::Mouse() = default;
Mouse::Mouse([[maybe_unused]] Mouse const& other) {
    frame::copy_required(m_Hole, other.m_Hole, k_any);
    frame::copy_required(m_Cheese, other.m_Cheese, k_any);
    m_nil = other.m_nil;
}
Mouse& Mouse::operator=(Mouse const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Mouse::~Mouse() = default;

void Mouse::swap(Mouse& other) { frame::swap_whole(*this, other); }
void Mouse::make_room_for(Mouse const&) {}
void Mouse::exchange([[maybe_unused]] Mouse& other) noexcept {
    m_Hole.swap(other.m_Hole);
    m_Cheese.swap(other.m_Cheese);
    std::swap(m_nil, other.m_nil);
}
void Mouse::reset() { frame::reset_by_swap(*this); }
bool Mouse::is_occurs_ok() const { return m_nil || (m_Hole.set && m_Cheese.set); }

qbxV2::eqbx_error Mouse::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {});
}
qbxV2::eqbx_error Mouse::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source, .is_nillable = true};
    return frame::unmarshal(*this, kind, reader, name);
}

std::wstring const& Mouse::get_Hole() const { return m_Hole.value; }
qbxV2::eqbx_error Mouse::set_Hole(std::wstring const& value) { return frame::set(m_Hole, value, k_any); }

std::wstring const& Mouse::get_Cheese() const { return m_Cheese.value; }
qbxV2::eqbx_error Mouse::set_Cheese(std::wstring const& value) { return frame::set(m_Cheese, value, k_any); }

bool Mouse::isnil_Mouse() const { return m_nil; }
void Mouse::setnil_Mouse() { m_nil = true; }

bool Mouse::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name,
                                 qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_Mouse_attributes);
    if (in.is_nil()) return in.read_nil(m_nil);
    return false;
}

qbxV2::eqbx_error Mouse::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Mouse::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Mouse_children, k_Mouse_next);
    in.begin({0, 1});
    in.required(0, m_Hole, k_any);
    in.required(1, m_Cheese, k_any);
    return in.done();
}

void Mouse::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Mouse::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.required(m_Hole, "Vrl:Hole");
    w.required(m_Cheese, "Vrl:Cheese");
    return w.result();
}

// Sign

Sign::Sign() = default;
Sign::Sign([[maybe_unused]] Sign const& other) {
    frame::copy_required(m_Sign, other.m_Sign, k_any);
    m_nil = other.m_nil;
}
Sign& Sign::operator=(Sign const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Sign::~Sign() = default;

void Sign::swap(Sign& other) { frame::swap_whole(*this, other); }
void Sign::make_room_for(Sign const&) {}
void Sign::exchange([[maybe_unused]] Sign& other) noexcept {
    m_Sign.swap(other.m_Sign);
    std::swap(m_nil, other.m_nil);
}
void Sign::reset() { frame::reset_by_swap(*this); }
bool Sign::is_occurs_ok() const { return m_nil || m_Sign.set; }

qbxV2::eqbx_error Sign::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.has_text_only = true});
}
qbxV2::eqbx_error Sign::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source, .has_text_only = true, .is_nillable = true};
    return frame::unmarshal(*this, kind, reader, name);
}

std::wstring const& Sign::get_Sign() const { return m_Sign.value; }
qbxV2::eqbx_error Sign::set_Sign(std::wstring const& value) {
    const qbxV2::eqbx_error result = frame::set(m_Sign, value, k_any);
    if (result == qbxV2::EQBX_NO_ERROR) m_nil = false;
    return result;
}

bool Sign::isnil_Sign() const { return m_nil; }
void Sign::setnil_Sign() { m_nil = true; }

bool Sign::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name,
                                qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_Sign_attributes);
    if (in.is_nil()) return in.read_nil(m_nil);
    return false;
}

qbxV2::eqbx_error Sign::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Sign::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error,
                          bool has_content) {
    frame::text_reader in(reader, *name, error, k_source);
    return in.read(m_Sign, k_any, has_content);
}

void Sign::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Sign::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    if (m_Sign.set) frame::put_value(out, m_Sign.value);
    return qbxV2::EQBX_NO_ERROR;
}

// House

House::House() = default;
House::House([[maybe_unused]] House const& other) {
    frame::copy_required(m_Cat, other.m_Cat);
    frame::copy_required(m_Call, other.m_Call);
    frame::copy_required(m_Mouse, other.m_Mouse);
    frame::copy_required(m_Sign, other.m_Sign);
}
House& House::operator=(House const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
House::~House() = default;

void House::swap(House& other) { frame::swap_whole(*this, other); }
void House::make_room_for(House const& other) {
    m_Cat.make_room_for(other.m_Cat);
    m_Call.make_room_for(other.m_Call);
    m_Mouse.make_room_for(other.m_Mouse);
    m_Sign.make_room_for(other.m_Sign);
}
void House::exchange([[maybe_unused]] House& other) noexcept {
    m_Cat.exchange(other.m_Cat);
    m_Call.exchange(other.m_Call);
    m_Mouse.exchange(other.m_Mouse);
    m_Sign.exchange(other.m_Sign);
}
void House::reset() { frame::reset_by_swap(*this); }
bool House::is_occurs_ok() const {
    return m_Cat.is_set() && m_Call.is_set() && m_Mouse.is_set() && m_Sign.is_set();
}

qbxV2::eqbx_error House::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error House::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

Cat const& House::get_Cat() const { return m_Cat.get(); }
Cat& House::get_Cat() { return m_Cat.get(); }
Cat& House::assign_Cat(Cat const& value) { return m_Cat.assign(value); }

Call const& House::get_Call() const { return m_Call.get(); }
Call& House::get_Call() { return m_Call.get(); }
Call& House::assign_Call(Call const& value) { return m_Call.assign(value); }

Mouse const& House::get_Mouse() const { return m_Mouse.get(); }
Mouse& House::get_Mouse() { return m_Mouse.get(); }
Mouse& House::assign_Mouse(Mouse const& value) { return m_Mouse.assign(value); }

Sign const& House::get_Sign() const { return m_Sign.get(); }
Sign& House::get_Sign() { return m_Sign.get(); }
Sign& House::assign_Sign(Sign const& value) { return m_Sign.assign(value); }

bool House::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error House::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool House::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_House_children, k_House_next);
    in.begin({0, 1});
    in.required(0, m_Cat);
    in.required(1, m_Call);
    in.required(2, m_Mouse);
    in.required(3, m_Sign);
    return in.done();
}

void House::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error House::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.required(m_Cat, "Vrl:Cat");
    w.required(m_Call, "Vrl:Call");
    w.required(m_Mouse, "Vrl:Mouse");
    w.required(m_Sign, "Vrl:Sign");
    return w.result();
}

// Stray

Stray::Stray() = default;
Stray::Stray([[maybe_unused]] Stray const& other) : CatType(other) {
    m_nil = other.m_nil;
}
Stray& Stray::operator=(Stray const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Stray::~Stray() = default;

void Stray::swap(Stray& other) { frame::swap_whole(*this, other); }
void Stray::make_room_for(Stray const& other) {
    CatType::make_room_for(other);
}
void Stray::exchange([[maybe_unused]] Stray& other) noexcept {
    CatType::exchange(other);
    std::swap(m_nil, other.m_nil);
}
void Stray::reset() { frame::reset_by_swap(*this); }
bool Stray::is_occurs_ok() const { return m_nil || CatType::is_occurs_ok(); }

qbxV2::eqbx_error Stray::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Stray::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source, .is_nillable = true};
    return frame::unmarshal(*this, kind, reader, name);
}

qbxV2::eqbx_error Stray::marshal(std::ostream& os) const {
    return frame::marshal_to_stream(frame::as_document(*this, "Vrl:Stray"), os);
}
qbxV2::eqbx_error Stray::marshal(std::string* text) const {
    return frame::marshal_to_string(frame::as_document(*this, "Vrl:Stray"), text);
}
qbxV2::eqbx_error Stray::marshal(char const* path) const {
    return frame::marshal_to_path(frame::as_document(*this, "Vrl:Stray"), path);
}
qbxV2::eqbx_error Stray::unmarshal(qbxV2::c_xml_reader& reader) {
    return frame::unmarshal_document(*this, reader, "Stray", k_source);
}
qbxV2::eqbx_error Stray::unmarshal(std::string const& text) {
    return frame::unmarshal_memory(*this, text.data(), text.size());
}
qbxV2::eqbx_error Stray::unmarshal(char const* bytes, unsigned length) {
    return frame::unmarshal_memory(*this, bytes, length);
}
qbxV2::eqbx_error Stray::unmarshal(char const* path) { return frame::unmarshal_path(*this, path); }
Stray::Stray(std::string const& text, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(text);
}
Stray::Stray(char const* bytes, unsigned length, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(bytes, length);
}
Stray::Stray(char const* path, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(path);
}

bool Stray::isnil_Stray() const { return m_nil; }
void Stray::setnil_Stray() { m_nil = true; }

bool Stray::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name,
                                 qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_Stray_attributes);
    if (in.is_nil()) return in.read_nil(m_nil);
    return CatType::unmarshal_attributes(reader, name, error);
}

// Call

Call::Call() = default;
Call::Call([[maybe_unused]] Call const& other) : CallType(other) {
    m_nil = other.m_nil;
}
Call& Call::operator=(Call const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Call::~Call() = default;

void Call::swap(Call& other) { frame::swap_whole(*this, other); }
void Call::make_room_for(Call const& other) {
    CallType::make_room_for(other);
}
void Call::exchange([[maybe_unused]] Call& other) noexcept {
    CallType::exchange(other);
    std::swap(m_nil, other.m_nil);
}
void Call::reset() { frame::reset_by_swap(*this); }
bool Call::is_occurs_ok() const { return m_nil || CallType::is_occurs_ok(); }

qbxV2::eqbx_error Call::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.has_text_only = true});
}
qbxV2::eqbx_error Call::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source, .has_text_only = true, .is_nillable = true};
    return frame::unmarshal(*this, kind, reader, name);
}

bool Call::isnil_Call() const { return m_nil; }
void Call::setnil_Call() { m_nil = true; }
std::wstring const& Call::get_Call() const { return get_CallType(); }
qbxV2::eqbx_error Call::set_Call(std::wstring const& value) {
    const qbxV2::eqbx_error result = set_CallType(value);
    if (result == qbxV2::EQBX_NO_ERROR) m_nil = false;
    return result;
}

bool Call::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name,
                                qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_Call_attributes);
    if (in.is_nil()) return in.read_nil(m_nil);
    return CallType::unmarshal_attributes(reader, name, error);
}

// Cat

Cat::Cat() = default;
Cat::Cat([[maybe_unused]] Cat const& other) : CatType(other) {
    m_nil = other.m_nil;
}
Cat& Cat::operator=(Cat const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Cat::~Cat() = default;

void Cat::swap(Cat& other) { frame::swap_whole(*this, other); }
void Cat::make_room_for(Cat const& other) {
    CatType::make_room_for(other);
}
void Cat::exchange([[maybe_unused]] Cat& other) noexcept {
    CatType::exchange(other);
    std::swap(m_nil, other.m_nil);
}
void Cat::reset() { frame::reset_by_swap(*this); }
bool Cat::is_occurs_ok() const { return m_nil || CatType::is_occurs_ok(); }

qbxV2::eqbx_error Cat::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {});
}
qbxV2::eqbx_error Cat::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source, .is_nillable = true};
    return frame::unmarshal(*this, kind, reader, name);
}

bool Cat::isnil_Cat() const { return m_nil; }
void Cat::setnil_Cat() { m_nil = true; }

bool Cat::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name,
                               qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_Cat_attributes);
    if (in.is_nil()) return in.read_nil(m_nil);
    return CatType::unmarshal_attributes(reader, name, error);
}

}  // namespace vrl_v2
