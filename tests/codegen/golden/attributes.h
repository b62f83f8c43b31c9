// Generated from schema/attributes.xsd. To change it, change the schema or V2/frame.
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

class VRL_API Ruler {
public:
    Ruler();
    Ruler(Ruler const& other);
    Ruler& operator=(Ruler const& other);
    virtual ~Ruler();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Ruler& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    /// The unit of the marks.
    std::wstring const& get_Unit() const;
    qbxV2::eqbx_error set_Unit(std::wstring const& value);

    double get_Length() const;
    qbxV2::eqbx_error set_Length(double value);
    bool isset_Length() const;
    void unset_Length();

    int get_Step() const;
    qbxV2::eqbx_error set_Step(int value);
    bool isset_Step() const;
    void unset_Step();

protected:
    friend struct frame::access;
    void make_room_for(Ruler const& other);
    void exchange(Ruler& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    void init();
    frame::single<std::wstring> m_Unit;
    frame::single<double> m_Length;
    frame::single<int> m_Step;
};

class VRL_API FoldingRuler : public Ruler {
public:
    FoldingRuler();
    FoldingRuler(FoldingRuler const& other);
    FoldingRuler& operator=(FoldingRuler const& other);
    ~FoldingRuler() override;
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(FoldingRuler& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    unsigned char get_Links() const;
    qbxV2::eqbx_error set_Links(unsigned char value);

protected:
    friend struct frame::access;
    void make_room_for(FoldingRuler const& other);
    void exchange(FoldingRuler& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;

private:
    frame::single<unsigned char> m_Links;
};

class VRL_API PaintedRuler : public Ruler {
public:
    PaintedRuler();
    PaintedRuler(PaintedRuler const& other);
    PaintedRuler& operator=(PaintedRuler const& other);
    ~PaintedRuler() override;
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(PaintedRuler& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    std::wstring const& get_Paint() const;
    qbxV2::eqbx_error set_Paint(std::wstring const& value);
    bool isset_Paint() const;
    void unset_Paint();

protected:
    friend struct frame::access;
    void make_room_for(PaintedRuler const& other);
    void exchange(PaintedRuler& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;

private:
    frame::single<std::wstring> m_Paint;
};

}  // namespace vrl_v2
