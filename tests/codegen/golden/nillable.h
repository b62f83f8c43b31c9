// Generated from schema/nillable.xsd. To change it, change the schema or V2/frame.
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

class VRL_API CatType {
public:
    CatType();
    CatType(CatType const& other);
    CatType& operator=(CatType const& other);
    virtual ~CatType();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(CatType& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    std::wstring const& get_Name() const;
    qbxV2::eqbx_error set_Name(std::wstring const& value);

protected:
    friend struct frame::access;
    void make_room_for(CatType const& other);
    void exchange(CatType& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<std::wstring> m_Name;
};

class VRL_API CallType {
public:
    CallType();
    CallType(CallType const& other);
    CallType& operator=(CallType const& other);
    virtual ~CallType();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(CallType& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    double get_Pitch() const;
    qbxV2::eqbx_error set_Pitch(double value);

    std::wstring const& get_CallType() const;
    qbxV2::eqbx_error set_CallType(std::wstring const& value);

protected:
    friend struct frame::access;
    void make_room_for(CallType const& other);
    void exchange(CallType& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error,
                        bool has_content);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<double> m_Pitch;
    frame::single<std::wstring> m_CallType;
};

class VRL_API Mouse {
public:
    Mouse();
    Mouse(Mouse const& other);
    Mouse& operator=(Mouse const& other);
    virtual ~Mouse();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Mouse& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    std::wstring const& get_Hole() const;
    qbxV2::eqbx_error set_Hole(std::wstring const& value);

    std::wstring const& get_Cheese() const;
    qbxV2::eqbx_error set_Cheese(std::wstring const& value);

    /// Whether the element is written as `xsi:nil`, without content.
    bool isnil_Mouse() const;
    void setnil_Mouse();

protected:
    friend struct frame::access;
    void make_room_for(Mouse const& other);
    void exchange(Mouse& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<std::wstring> m_Hole;
    frame::single<std::wstring> m_Cheese;
    bool m_nil = false;
};

class VRL_API Sign {
public:
    Sign();
    Sign(Sign const& other);
    Sign& operator=(Sign const& other);
    virtual ~Sign();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Sign& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    std::wstring const& get_Sign() const;
    qbxV2::eqbx_error set_Sign(std::wstring const& value);

    /// Whether the element is written as `xsi:nil`, without content.
    bool isnil_Sign() const;
    void setnil_Sign();

protected:
    friend struct frame::access;
    void make_room_for(Sign const& other);
    void exchange(Sign& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error,
                        bool has_content);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<std::wstring> m_Sign;
    bool m_nil = false;
};

class VRL_API House {
public:
    House();
    House(House const& other);
    House& operator=(House const& other);
    virtual ~House();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(House& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    Cat const& get_Cat() const;
    Cat& get_Cat();
    Cat& assign_Cat(Cat const& value);

    Call const& get_Call() const;
    Call& get_Call();
    Call& assign_Call(Call const& value);

    Mouse const& get_Mouse() const;
    Mouse& get_Mouse();
    Mouse& assign_Mouse(Mouse const& value);

    Sign const& get_Sign() const;
    Sign& get_Sign();
    Sign& assign_Sign(Sign const& value);

protected:
    friend struct frame::access;
    void make_room_for(House const& other);
    void exchange(House& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::child<Cat> m_Cat;
    frame::child<Call> m_Call;
    frame::child<Mouse> m_Mouse;
    frame::child<Sign> m_Sign;
};

class VRL_API Stray : public CatType {
public:
    Stray();
    Stray(Stray const& other);
    Stray& operator=(Stray const& other);
    ~Stray() override;
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Stray& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    /// A document that holds this element alone. The path forms give EQBX_FILE_NOT_OPENED for a file that
    /// cannot be opened; a failed write to a path deletes the file, one to a text leaves it alone.
    qbxV2::eqbx_error marshal(std::ostream& os) const;
    qbxV2::eqbx_error marshal(std::string* text) const;
    qbxV2::eqbx_error marshal(char const* path) const;
    /// Reading does not reset the object first.
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader);
    qbxV2::eqbx_error unmarshal(std::string const& text);
    qbxV2::eqbx_error unmarshal(char const* bytes, unsigned length);
    qbxV2::eqbx_error unmarshal(char const* path);
    Stray(std::string const& text, qbxV2::eqbx_error* error);
    Stray(char const* bytes, unsigned length, qbxV2::eqbx_error* error);
    Stray(char const* path, qbxV2::eqbx_error* error);

    /// Whether the element is written as `xsi:nil`, without content.
    bool isnil_Stray() const;
    void setnil_Stray();

protected:
    friend struct frame::access;
    void make_room_for(Stray const& other);
    void exchange(Stray& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);

private:
    bool m_nil = false;
};

class VRL_API Call : public CallType {
public:
    Call();
    Call(Call const& other);
    Call& operator=(Call const& other);
    ~Call() override;
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Call& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    /// Whether the element is written as `xsi:nil`, without content.
    bool isnil_Call() const;
    void setnil_Call();
    /// The text; setting it clears the nil flag.
    std::wstring const& get_Call() const;
    qbxV2::eqbx_error set_Call(std::wstring const& value);

protected:
    friend struct frame::access;
    void make_room_for(Call const& other);
    void exchange(Call& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);

private:
    bool m_nil = false;
};

class VRL_API Cat : public CatType {
public:
    Cat();
    Cat(Cat const& other);
    Cat& operator=(Cat const& other);
    ~Cat() override;
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Cat& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    /// Whether the element is written as `xsi:nil`, without content.
    bool isnil_Cat() const;
    void setnil_Cat();

protected:
    friend struct frame::access;
    void make_room_for(Cat const& other);
    void exchange(Cat& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);

private:
    bool m_nil = false;
};

}  // namespace vrl_v2
