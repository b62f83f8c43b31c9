// Generated from schema/group.xsd. To change it, change the schema or V2/frame.
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

class VRL_API ShapeType {
public:
    /// Identity of this class, compared by pointer.
    static char const* id;

    ShapeType();
    ShapeType(ShapeType const& other);
    ShapeType& operator=(ShapeType const& other);
    virtual ShapeType* clone() const;
    virtual ~ShapeType();
    virtual char const* getid() const;
    virtual bool has_id(char const* identity) const;
    virtual qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    virtual qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);
    /// A new object of the class of this family whose `id` is `type_name`; the caller owns it. Null when
    /// there is none, or when `ns_id` is not the document namespace's.
    static ShapeType* factory(int ns_id, std::string const& type_name);

    void swap(ShapeType& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    double get_Area() const;
    qbxV2::eqbx_error set_Area(double value);
    bool isset_Area() const;
    void unset_Area();

protected:
    friend struct frame::access;
    void make_room_for(ShapeType const& other);
    void exchange(ShapeType& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::single<double> m_Area;
};

class VRL_API Plate {
public:
    Plate();
    Plate(Plate const& other);
    Plate& operator=(Plate const& other);
    virtual ~Plate();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Plate& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    /// A shape that tells its type by xsi:type.
    sg_Shape const& get_Shape() const;
    sg_Shape& get_Shape();
    sg_Shape& assign_Shape(sg_Shape const& value);

    unsigned size_Hole() const;
    sg_Hole const& get_Hole(unsigned i) const;
    sg_Hole& get_Hole(unsigned i);
    sg_Hole& back_Hole();
    sg_Hole& assign_Hole(unsigned i, sg_Hole const& value);
    qbxV2::eqbx_error append_Hole();
    qbxV2::eqbx_error insert_Hole(unsigned i);
    void delete_Hole(unsigned i);
    void clear_Hole();

    double get_Thickness() const;
    qbxV2::eqbx_error set_Thickness(double value);
    bool isset_Thickness() const;
    void unset_Thickness();

protected:
    friend struct frame::access;
    void make_room_for(Plate const& other);
    void exchange(Plate& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::child<sg_Shape> m_Shape;
    frame::list<sg_Hole> m_Hole;
    frame::single<double> m_Thickness;
};

class VRL_API Cover {
public:
    Cover();
    Cover(Cover const& other);
    Cover& operator=(Cover const& other);
    virtual ~Cover();
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name);

    void swap(Cover& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

    /// A shape that tells its type by xsi:type.
    unsigned size_Shape() const;
    sg_Shape const& get_Shape(unsigned i) const;
    sg_Shape& get_Shape(unsigned i);
    sg_Shape& back_Shape();
    sg_Shape& assign_Shape(unsigned i, sg_Shape const& value);
    qbxV2::eqbx_error append_Shape();
    qbxV2::eqbx_error insert_Shape(unsigned i);
    void delete_Shape(unsigned i);
    void clear_Shape();

    sg_Hole const& get_Hole() const;
    sg_Hole& get_Hole();
    sg_Hole& assign_Hole(sg_Hole const& value);
    bool isset_Hole() const;
    void unset_Hole();

protected:
    friend struct frame::access;
    void make_room_for(Cover const& other);
    void exchange(Cover& other) noexcept;
    bool unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error unmarshal_attributes_check(qbxV2::c_xml_reader& reader);
    void marshal_attributes(qbxV2::c_xml_writer& out) const;
    bool unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::list<sg_Shape> m_Shape;
    frame::child<sg_Hole> m_Hole;
};

/// One object of the substitution group Shape.
class VRL_API sg_Shape {
public:
    enum eqbx_chosen : int {
        chosen_Shape = 0,
        chosen_Circle = 1,
        chosen_Square = 2,
        chosen_none = 4,
    };
    eqbx_chosen getchosen() const { return static_cast<eqbx_chosen>(m_held.state()); }

    sg_Shape();
    sg_Shape(sg_Shape const& other);
    sg_Shape& operator=(sg_Shape const& other);
    virtual ~sg_Shape();

    void swap(sg_Shape& other);
    void reset();
    bool is_occurs_ok() const;
    /// Writes the held object under its own element's name, whatever `name` is.
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    /// Whether the reader stands on an element of this group; leaves its event alone if not.
    static bool is_member(qbxV2::c_xml_reader& reader, std::string const& name);
    /// Reads the element of this group that the reader stands on, and moves behind it.
    bool unmarshal(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);

    /// A mutable reference, and assigning, make the group hold that member.
    ShapeType const& get_Shape() const;
    ShapeType& get_Shape();
    ShapeType& assign_Shape(ShapeType const& value);
    CircleType const& get_Circle() const;
    CircleType& get_Circle();
    CircleType& assign_Circle(CircleType const& value);
    SquareType const& get_Square() const;
    SquareType& get_Square();
    SquareType& assign_Square(SquareType const& value);

protected:
    friend struct frame::access;
    void make_room_for(sg_Shape const& other);
    void exchange(sg_Shape& other) noexcept;
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::held<ShapeType> m_held;
};

/// One object of the substitution group Hole.
class VRL_API sg_Hole {
public:
    enum eqbx_chosen : int {
        chosen_RoundHole = 0,
        chosen_none = 2,
    };
    eqbx_chosen getchosen() const { return static_cast<eqbx_chosen>(m_held.state()); }

    sg_Hole();
    sg_Hole(sg_Hole const& other);
    sg_Hole& operator=(sg_Hole const& other);
    virtual ~sg_Hole();

    void swap(sg_Hole& other);
    void reset();
    bool is_occurs_ok() const;
    /// Writes the held object under its own element's name, whatever `name` is.
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    /// Whether the reader stands on an element of this group; leaves its event alone if not.
    static bool is_member(qbxV2::c_xml_reader& reader, std::string const& name);
    /// Reads the element of this group that the reader stands on, and moves behind it.
    bool unmarshal(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);

    /// A mutable reference, and assigning, make the group hold that member.
    CircleType const& get_RoundHole() const;
    CircleType& get_RoundHole();
    CircleType& assign_RoundHole(CircleType const& value);

protected:
    friend struct frame::access;
    void make_room_for(sg_Hole const& other);
    void exchange(sg_Hole& other) noexcept;
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::held<ShapeType> m_held;
};

class VRL_API CircleType : public ShapeType {
public:
    /// Identity of this class, compared by pointer.
    static char const* id;

    CircleType();
    CircleType(CircleType const& other);
    CircleType& operator=(CircleType const& other);
    CircleType* clone() const override;
    ~CircleType() override;
    char const* getid() const override;
    bool has_id(char const* identity) const override;
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const override;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) override;

    void swap(CircleType& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

protected:
    friend struct frame::access;
    void make_room_for(CircleType const& other);
    void exchange(CircleType& other) noexcept;

private:
};

class VRL_API SquareType : public ShapeType {
public:
    /// Identity of this class, compared by pointer.
    static char const* id;

    SquareType();
    SquareType(SquareType const& other);
    SquareType& operator=(SquareType const& other);
    SquareType* clone() const override;
    ~SquareType() override;
    char const* getid() const override;
    bool has_id(char const* identity) const override;
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const override;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) override;

    void swap(SquareType& other);
    void reset();
    /// Whether everything that writing demands of this element itself is present.
    bool is_occurs_ok() const;

protected:
    friend struct frame::access;
    void make_room_for(SquareType const& other);
    void exchange(SquareType& other) noexcept;

private:
};

/// A shape that tells its type by xsi:type.
class VRL_API Shape : public ShapeType {
public:
    Shape();
    Shape(Shape const& other);
    Shape& operator=(Shape const& other);
    ~Shape() override;
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
    Shape(std::string const& text, qbxV2::eqbx_error* error);
    Shape(char const* bytes, unsigned length, qbxV2::eqbx_error* error);
    Shape(char const* path, qbxV2::eqbx_error* error);
};

class VRL_API Hole : public ShapeType {
public:
    Hole();
    Hole(Hole const& other);
    Hole& operator=(Hole const& other);
    ~Hole() override;
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
    Hole(std::string const& text, qbxV2::eqbx_error* error);
    Hole(char const* bytes, unsigned length, qbxV2::eqbx_error* error);
    Hole(char const* path, qbxV2::eqbx_error* error);
};

class VRL_API Circle : public CircleType {
public:
    Circle();
    Circle(Circle const& other);
    Circle& operator=(Circle const& other);
    ~Circle() override;
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
    Circle(std::string const& text, qbxV2::eqbx_error* error);
    Circle(char const* bytes, unsigned length, qbxV2::eqbx_error* error);
    Circle(char const* path, qbxV2::eqbx_error* error);
};

class VRL_API Square : public SquareType {
public:
    Square();
    Square(Square const& other);
    Square& operator=(Square const& other);
    ~Square() override;
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
    Square(std::string const& text, qbxV2::eqbx_error* error);
    Square(char const* bytes, unsigned length, qbxV2::eqbx_error* error);
    Square(char const* path, qbxV2::eqbx_error* error);
};

class VRL_API RoundHole : public CircleType {
public:
    RoundHole();
    RoundHole(RoundHole const& other);
    RoundHole& operator=(RoundHole const& other);
    ~RoundHole() override;
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const override;
    qbxV2::eqbx_error unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) override;
};

}  // namespace vrl_v2
