// Generated from schema/any.xsd. To change it, change the schema or V2/frame.
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

class VRL_API Box {
public:
    Box();
    Box(Box const& other);
    Box& operator=(Box const& other);
    virtual ~Box();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Box& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    /// Elements of any name, as text. Written as they stand: an entry has to be well-formed XML.
    unsigned size_any() const;
    /// `ns` and `name` may be null.
    void get_any(unsigned i, std::string* ns, std::string* name, std::string* value) const;
    qbxV2::eqbx_error append_any(std::string const& value);
    qbxV2::eqbx_error insert_any(unsigned i, std::string const& value);
    void delete_any(unsigned i);
    void clear_any();

protected:
    friend struct frame::access;
    void make_room_for(Box const& other);
    void exchange(Box& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::list<qbxV2::c_any_info> m_any;
};

class VRL_API Attic {
public:
    Attic();
    Attic(Attic const& other);
    Attic& operator=(Attic const& other);
    virtual ~Attic();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Attic& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    Box const& get_Box() const;
    Box& get_Box();
    Box& assign_Box(Box const& value);
    bool isset_Box() const;
    void unset_Box();

protected:
    friend struct frame::access;
    void make_room_for(Attic const& other);
    void exchange(Attic& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::child<Box> m_Box;
};

}  // namespace vrl_v2
