// Generated from schema/enumerations.xsd. To change it, change the schema or V2/frame.
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

class VRL_API Shirt {
public:
    Shirt();
    Shirt(Shirt const& other);
    Shirt& operator=(Shirt const& other);
    virtual ~Shirt();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Shirt& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    /// How large a shirt is.
    enum Eenum_Size : int {
        Size_no_match = 0,
        Size_Small = 1,        ///< "Small"
        Size_Medium = 2,       ///< "Medium"
        Size_Extra_Large = 3,  ///< "Extra-Large"
    };
    /// Refuses: EQBX_VALUE_NOT_ENUMERATED for any other text.
    std::wstring const& get_Size() const;
    qbxV2::eqbx_error set_Size(std::wstring const& value);
    Eenum_Size getenum_Size() const;
    bool setenum_Size(Eenum_Size value);

    enum Eenum_Fabric : int {
        Fabric_no_match = 0,
        Fabric_Cotton = 1,  ///< "Cotton"
        Fabric_Flax = 2,    ///< "Flax"
    };
    /// Refuses: EQBX_VALUE_NOT_ENUMERATED for any other text.
    std::wstring const& get_Fabric() const;
    qbxV2::eqbx_error set_Fabric(std::wstring const& value);
    Eenum_Fabric getenum_Fabric() const;
    bool setenum_Fabric(Eenum_Fabric value);

protected:
    friend struct frame::access;
    void make_room_for(Shirt const& other);
    void exchange(Shirt& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<std::wstring> m_Size;
    frame::single<std::wstring> m_Fabric;
};

class VRL_API Sleeve {
public:
    Sleeve();
    Sleeve(Sleeve const& other);
    Sleeve& operator=(Sleeve const& other);
    virtual ~Sleeve();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Sleeve& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    /// How large a shirt is.
    enum Eenum_Sleeve : int {
        Sleeve_no_match = 0,
        Sleeve_Small = 1,        ///< "Small"
        Sleeve_Medium = 2,       ///< "Medium"
        Sleeve_Extra_Large = 3,  ///< "Extra-Large"
    };
    /// Refuses: EQBX_VALUE_NOT_ENUMERATED for any other text.
    std::wstring const& get_Sleeve() const;
    qbxV2::eqbx_error set_Sleeve(std::wstring const& value);
    Eenum_Sleeve getenum_Sleeve() const;
    bool setenum_Sleeve(Eenum_Sleeve value);

protected:
    friend struct frame::access;
    void make_room_for(Sleeve const& other);
    void exchange(Sleeve& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error,
                        bool has_content);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<std::wstring> m_Sleeve;
};

class VRL_API Measure {
public:
    enum eqbx_chosen : int {
        chosen_Size = 0,
        chosen_Girth = 1,
        chosen_none = 2,
    };
    eqbx_chosen getchosen() const { return m_chosen; }

    Measure();
    Measure(Measure const& other);
    Measure& operator=(Measure const& other);
    virtual ~Measure();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Measure& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    /// How large a shirt is.
    enum Eenum_Size : int {
        Size_no_match = 0,
        Size_Small = 1,        ///< "Small"
        Size_Medium = 2,       ///< "Medium"
        Size_Extra_Large = 3,  ///< "Extra-Large"
    };
    /// Refuses: EQBX_VALUE_NOT_ENUMERATED for any other text.
    std::wstring const& get_Size() const;
    qbxV2::eqbx_error set_Size(std::wstring const& value);
    Eenum_Size getenum_Size() const;
    bool setenum_Size(Eenum_Size value);

    double get_Girth() const;
    qbxV2::eqbx_error set_Girth(double value);

protected:
    friend struct frame::access;
    void make_room_for(Measure const& other);
    void exchange(Measure& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    void choose(eqbx_chosen option);
    void release_choice();

    eqbx_chosen m_chosen = chosen_none;
    frame::option<std::wstring> m_Size;
    frame::option<double> m_Girth;
};

}  // namespace vrl_v2
