// Generated from schema/polymorphic.xsd. To change it, change the schema or V2/frame.
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

class VRL_API AnimalType {
public:
    /// Identity of this class, compared by pointer.
    static char const* id;

    AnimalType();
    AnimalType(AnimalType const& other);
    AnimalType& operator=(AnimalType const& other);
    virtual AnimalType* clone() const;
    virtual ~AnimalType();
    virtual char const* getid() const;
    virtual bool has_id(char const* identity) const;
    virtual qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    virtual qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);
    /// A new object of the class of this family whose `id` is `type_name`; the caller owns it. Null when
    /// there is none, or when `ns_id` is not the document namespace's.
    static AnimalType* factory(int ns_id, std::string const& type_name);

    void swap(AnimalType& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    int get_Tag() const;
    qbxV2::eqbx_error set_Tag(int value);
    bool isset_Tag() const;
    void unset_Tag();

    std::wstring const& get_Name() const;
    qbxV2::eqbx_error set_Name(std::wstring const& value);

protected:
    friend struct frame::access;
    void make_room_for(AnimalType const& other);
    void exchange(AnimalType& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<int> m_Tag;
    frame::single<std::wstring> m_Name;
};

class VRL_API BirdType : public AnimalType {
public:
    /// Identity of this class, compared by pointer.
    static char const* id;

    BirdType();
    BirdType(BirdType const& other);
    BirdType& operator=(BirdType const& other);
    BirdType* clone() const override;
    ~BirdType() override;
    char const* getid() const override;
    bool has_id(char const* identity) const override;
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const override;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) override;
    /// A new object of the class of this family whose `id` is `type_name`; the caller owns it. Null when
    /// there is none, or when `ns_id` is not the document namespace's.
    static BirdType* factory(int ns_id, std::string const& type_name);

    void swap(BirdType& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    double get_Span() const;
    qbxV2::eqbx_error set_Span(double value);
    bool isset_Span() const;
    void unset_Span();

protected:
    friend struct frame::access;
    void make_room_for(BirdType const& other);
    void exchange(BirdType& other) noexcept;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<double> m_Span;
};

class VRL_API OwlType : public BirdType {
public:
    /// Identity of this class, compared by pointer.
    static char const* id;

    OwlType();
    OwlType(OwlType const& other);
    OwlType& operator=(OwlType const& other);
    OwlType* clone() const override;
    ~OwlType() override;
    char const* getid() const override;
    bool has_id(char const* identity) const override;
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const override;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) override;

    void swap(OwlType& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

protected:
    friend struct frame::access;
    void make_room_for(OwlType const& other);
    void exchange(OwlType& other) noexcept;

private:
};

class VRL_API Owl : public OwlType {
public:
    Owl();
    Owl(Owl const& other);
    Owl& operator=(Owl const& other);
    ~Owl() override;
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const override;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) override;

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
    Owl(std::string const& text, qbxV2::eqbx_error* error);
    Owl(char const* bytes, unsigned length, qbxV2::eqbx_error* error);
    Owl(char const* path, qbxV2::eqbx_error* error);
};

}  // namespace vrl_v2
