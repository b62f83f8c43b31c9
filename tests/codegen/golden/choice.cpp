// Generated from schema/choice.xsd. To change it, change the schema or V2/frame.
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
constexpr char k_source[] = "V2/choice.cpp";

constexpr frame::no_limits k_any;
constexpr frame::range k_Payment_Amount = frame::range().from(0.0);

// Names, a row each, and which of them may follow at each position.
constexpr qbxV2::s_event_map k_Coin_children[] = {
    {k_document_namespace_id, "Face", 4, token::e_Face},
};
constexpr frame::names_between k_Coin_next[] = {{1, 1}};
constexpr qbxV2::s_event_map k_Payment_attributes[] = {
    {qbxV2::k_ns_none, "Payer", 5, token::a_Payer},
};
constexpr qbxV2::s_event_map k_Payment_children[] = {
    {k_document_namespace_id, "Amount", 6, token::e_Amount},
    {k_document_namespace_id, "Promise", 7, token::e_Promise},
    {k_document_namespace_id, "Coin", 4, token::e_Coin},
};
constexpr frame::names_between k_Payment_next[] = {{0, 3}, {0, 3}, {0, 3}};
constexpr qbxV2::s_event_map k_Sale_children[] = {
    {k_document_namespace_id, "Payment", 7, token::e_Payment},
};
constexpr frame::names_between k_Sale_next[] = {{1, 1}};

}  // namespace

// Coin

Coin::Coin() = default;
Coin::Coin([[maybe_unused]] Coin const& other) {
    frame::copy_required(m_Face, other.m_Face, k_any);
}
Coin& Coin::operator=(Coin const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Coin::~Coin() = default;

void Coin::swap(Coin& other) { frame::swap_whole(*this, other); }
void Coin::make_room_for(Coin const&) {}
void Coin::exchange([[maybe_unused]] Coin& other) noexcept {
    m_Face.swap(other.m_Face);
}
void Coin::reset() { frame::reset_by_swap(*this); }
bool Coin::is_occurs_ok() const { return m_Face.set; }

qbxV2::eqbx_error Coin::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Coin::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

std::wstring const& Coin::get_Face() const { return m_Face.value; }
qbxV2::eqbx_error Coin::set_Face(std::wstring const& value) { return frame::set(m_Face, value, k_any); }

bool Coin::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error Coin::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Coin::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Coin_children, k_Coin_next);
    in.begin({0, 1});
    in.required(0, m_Face, k_any);
    return in.done();
}

void Coin::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Coin::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.required(m_Face, "Vrl:Face");
    return w.result();
}

// Payment

Payment::Payment() = default;
Payment::Payment([[maybe_unused]] Payment const& other) {
    frame::copy_optional(m_Payer, other.m_Payer, k_any);
    if (other.m_chosen == chosen_Amount) set_Amount(other.get_Amount());
    if (other.m_chosen == chosen_Promise) set_Promise(other.get_Promise());
    if (other.m_chosen == chosen_Coin) assign_Coin(other.get_Coin());
}
Payment& Payment::operator=(Payment const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Payment::~Payment() = default;

void Payment::swap(Payment& other) { frame::swap_whole(*this, other); }
void Payment::make_room_for(Payment const&) {}
void Payment::exchange([[maybe_unused]] Payment& other) noexcept {
    std::swap(m_chosen, other.m_chosen);
    m_Payer.swap(other.m_Payer);
    m_Amount.swap(other.m_Amount);
    m_Promise.swap(other.m_Promise);
    m_Coin.swap(other.m_Coin);
}
void Payment::reset() { frame::reset_by_swap(*this); }
bool Payment::is_occurs_ok() const { return m_chosen != chosen_none; }

void Payment::choose(eqbx_chosen option) {
    if (m_chosen == option) return;
    release_choice();
    m_chosen = option;
}

void Payment::release_choice() {
    m_Amount.release();
    m_Promise.release();
    m_Coin.release();
    m_chosen = chosen_none;
}

qbxV2::eqbx_error Payment::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Payment::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

std::wstring const& Payment::get_Payer() const { return m_Payer.value; }
qbxV2::eqbx_error Payment::set_Payer(std::wstring const& value) { return frame::set(m_Payer, value, k_any); }
bool Payment::isset_Payer() const { return m_Payer.set; }
void Payment::unset_Payer() { m_Payer.set = false; }

double Payment::get_Amount() const { return m_Amount.get(); }
// Intended: the choice moves before the value is checked.
qbxV2::eqbx_error Payment::set_Amount(double value) {
    choose(chosen_Amount);
    double& stored = m_Amount.get();
    const qbxV2::eqbx_error refused = k_Payment_Amount.check(value);
    if (refused == qbxV2::EQBX_NO_ERROR) stored = value;
    return refused;
}

std::wstring const& Payment::get_Promise() const { return m_Promise.get(); }
// Intended: the choice moves before the value is checked.
qbxV2::eqbx_error Payment::set_Promise(std::wstring const& value) {
    choose(chosen_Promise);
    std::wstring& stored = m_Promise.get();
    const qbxV2::eqbx_error refused = k_any.check(value);
    if (refused == qbxV2::EQBX_NO_ERROR) stored = value;
    return refused;
}

Coin const& Payment::get_Coin() const { return m_Coin.get(); }
Coin& Payment::get_Coin() {
    choose(chosen_Coin);
    return m_Coin.get();
}
Coin& Payment::assign_Coin(Coin const& value) {
    frame::assign_by_swap(get_Coin(), value);
    return get_Coin();
}

bool Payment::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name,
                                   qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_Payment_attributes);
    switch (in.which()) {
        case 0:
            return in.read(m_Payer, k_any);
        default:
            return false;
    }
}

qbxV2::eqbx_error Payment::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Payment::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Payment_children, k_Payment_next);
    in.begin({0, 3});
    switch (in.which()) {
        case 0:
            choose(chosen_Amount);
            in.option_value(m_Amount.get(), k_Payment_Amount);
            break;
        case 1:
            choose(chosen_Promise);
            in.option_value(m_Promise.get(), k_any);
            break;
        case 2:
            choose(chosen_Coin);
            in.option_object(m_Coin.get());
            break;
        default:
            in.no_option();
            break;
    }
    return in.done();
}

void Payment::marshal_attributes(qbxV2::c_xml_writer& out) const {
    frame::attributes_writer w(out);
    w.if_set(m_Payer, "Payer");
}

qbxV2::eqbx_error Payment::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    switch (m_chosen) {
        case chosen_Amount:
            w.value(m_Amount.get(), "Vrl:Amount");
            break;
        case chosen_Promise:
            w.value(m_Promise.get(), "Vrl:Promise");
            break;
        case chosen_Coin:
            w.object(m_Coin.get(), "Vrl:Coin");
            break;
        default:
            return out.handle_error(qbxV2::EQBX_BAD_CHOICE, "Vrl:Payment", k_source, __LINE__);
    }
    return w.result();
}

// Sale

Sale::Sale() = default;
Sale::Sale([[maybe_unused]] Sale const& other) {
    frame::copy_required(m_Payment, other.m_Payment);
}
Sale& Sale::operator=(Sale const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Sale::~Sale() = default;

void Sale::swap(Sale& other) { frame::swap_whole(*this, other); }
void Sale::make_room_for(Sale const& other) {
    m_Payment.make_room_for(other.m_Payment);
}
void Sale::exchange([[maybe_unused]] Sale& other) noexcept {
    m_Payment.exchange(other.m_Payment);
}
void Sale::reset() { frame::reset_by_swap(*this); }
bool Sale::is_occurs_ok() const { return frame::has_chosen(m_Payment); }

qbxV2::eqbx_error Sale::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Sale::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

Payment const& Sale::get_Payment() const { return m_Payment.get(); }
Payment& Sale::get_Payment() { return m_Payment.get(); }
Payment& Sale::assign_Payment(Payment const& value) { return m_Payment.assign(value); }

bool Sale::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error Sale::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Sale::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Sale_children, k_Sale_next);
    in.begin({0, 1});
    in.required(0, m_Payment);
    return in.done();
}

void Sale::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Sale::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.required(m_Payment, "Vrl:Payment");
    return w.result();
}

}  // namespace vrl_v2
