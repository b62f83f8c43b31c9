// Generated from schema/objects.xsd. To change it, change the schema or V2/frame.
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

class VRL_API Lens {
public:
    Lens();
    Lens(Lens const& other);
    Lens& operator=(Lens const& other);
    virtual ~Lens();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Lens& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    double get_FocalLength() const;
    qbxV2::eqbx_error set_FocalLength(double value);

protected:
    friend struct frame::access;
    void make_room_for(Lens const& other);
    void exchange(Lens& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<double> m_FocalLength;
};

class VRL_API CameraBody {
public:
    CameraBody();
    CameraBody(CameraBody const& other);
    CameraBody& operator=(CameraBody const& other);
    virtual ~CameraBody();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(CameraBody& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    std::wstring const& get_Maker() const;
    qbxV2::eqbx_error set_Maker(std::wstring const& value);

protected:
    friend struct frame::access;
    void make_room_for(CameraBody const& other);
    void exchange(CameraBody& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<std::wstring> m_Maker;
};

class VRL_API Camera {
public:
    Camera();
    Camera(Camera const& other);
    Camera& operator=(Camera const& other);
    virtual ~Camera();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Camera& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    Lens const& get_Front() const;
    Lens& get_Front();
    Lens& assign_Front(Lens const& value);

    Lens const& get_Back() const;
    Lens& get_Back();
    Lens& assign_Back(Lens const& value);
    bool isset_Back() const;
    void unset_Back();

    CameraBody const& get_Body() const;
    CameraBody& get_Body();
    CameraBody& assign_Body(CameraBody const& value);

    Lens const& get_Strap() const;
    Lens& get_Strap();
    Lens& assign_Strap(Lens const& value);

    Tripod const& get_Tripod() const;
    Tripod& get_Tripod();
    Tripod& assign_Tripod(Tripod const& value);
    bool isset_Tripod() const;
    void unset_Tripod();

protected:
    friend struct frame::access;
    void make_room_for(Camera const& other);
    void exchange(Camera& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::child<Lens> m_Front;
    frame::child<Lens> m_Back;
    frame::child<CameraBody> m_Body;
    frame::child<Lens> m_Strap;
    frame::child<Tripod> m_Tripod;
};

class VRL_API Tripod : public Lens {
public:
    Tripod();
    Tripod(Tripod const& other);
    Tripod& operator=(Tripod const& other);
    ~Tripod() override;
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

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
    Tripod(std::string const& text, qbxV2::eqbx_error* error);
    Tripod(char const* bytes, unsigned length, qbxV2::eqbx_error* error);
    Tripod(char const* path, qbxV2::eqbx_error* error);
};

}  // namespace vrl_v2
