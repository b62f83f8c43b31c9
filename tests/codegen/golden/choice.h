// Generated from schema/choice.xsd. To change it, change the schema or V2/frame.
#pragma once

#include <iosfwd>
#include <string>

#include "V2/document_result.h"
#include "V2/forward.h"
#include "V2/frame/storage.h"
#include "platform/api.h"
#include "runtime/values.h"
#include "runtime/xml_reader.h"
#include "runtime/xml_writer.h"

namespace vrl_v2 {

class VRL_API Coin {
public:
    Coin();
    Coin(Coin const& other);
    Coin& operator=(Coin const& other);
    virtual ~Coin();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Coin& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    std::wstring const& get_Face() const;
    qbxV2::eqbx_error set_Face(std::wstring const& value);

protected:
    friend struct frame::access;
    void make_room_for(Coin const& other);
    void exchange(Coin& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<std::wstring> m_Face;
};

class VRL_API Payment {
public:
    enum eqbx_chosen : int {
        chosen_Amount = 0,
        chosen_Promise = 1,
        chosen_Coin = 2,
        chosen_none = 3,
    };
    eqbx_chosen getchosen() const { return m_chosen; }

    Payment();
    Payment(Payment const& other);
    Payment& operator=(Payment const& other);
    virtual ~Payment();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Payment& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    std::wstring const& get_Payer() const;
    qbxV2::eqbx_error set_Payer(std::wstring const& value);
    bool isset_Payer() const;
    void unset_Payer();

    /// Refuses: EQBX_VALUE_TOO_SMALL below 0.0.
    double get_Amount() const;
    qbxV2::eqbx_error set_Amount(double value);

    std::wstring const& get_Promise() const;
    qbxV2::eqbx_error set_Promise(std::wstring const& value);

    Coin const& get_Coin() const;
    Coin& get_Coin();
    Coin& assign_Coin(Coin const& value);

protected:
    friend struct frame::access;
    void make_room_for(Payment const& other);
    void exchange(Payment& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    void choose(eqbx_chosen option);
    void release_choice();

    eqbx_chosen m_chosen = chosen_none;
    frame::single<std::wstring> m_Payer;
    frame::option<double> m_Amount;
    frame::option<std::wstring> m_Promise;
    frame::option<Coin> m_Coin;
};

class VRL_API Sale {
public:
    Sale();
    Sale(Sale const& other);
    Sale& operator=(Sale const& other);
    virtual ~Sale();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Sale& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    Payment const& get_Payment() const;
    Payment& get_Payment();
    Payment& assign_Payment(Payment const& value);

protected:
    friend struct frame::access;
    void make_room_for(Sale const& other);
    void exchange(Sale& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::child<Payment> m_Payment;
};

}  // namespace vrl_v2
