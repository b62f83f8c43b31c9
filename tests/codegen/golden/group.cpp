// Generated from schema/group.xsd. To change it, change the schema or V2/frame.
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
constexpr char k_source[] = "V2/group.cpp";

constexpr frame::no_limits k_any;

// Names, a row each, and which of them may follow at each position.
constexpr qbxV2::s_event_map k_ShapeType_children[] = {
    {k_document_namespace_id, "Area", 4, token::e_Area},
};
constexpr frame::names_between k_ShapeType_next[] = {{1, 1}};
constexpr qbxV2::s_event_map k_Plate_children[] = {
    {frame::k_group_row, "Shape", 0, 0},
    {frame::k_group_row, "Hole", 0, 0},
    {k_document_namespace_id, "Thickness", 9, token::e_Thickness},
};
constexpr frame::names_between k_Plate_next[] = {{1, 3}, {1, 3}, {3, 3}};
constexpr qbxV2::s_event_map k_Cover_children[] = {
    {frame::k_group_row, "Shape", 0, 0},
    {frame::k_group_row, "Hole", 0, 0},
};
constexpr frame::names_between k_Cover_next[] = {{0, 2}, {2, 2}};

}  // namespace

// ShapeType

ShapeType::ShapeType() = default;
ShapeType::ShapeType([[maybe_unused]] ShapeType const& other) {
    frame::copy_optional(m_Area, other.m_Area, k_any);
}
ShapeType& ShapeType::operator=(ShapeType const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
ShapeType::~ShapeType() = default;

void ShapeType::swap(ShapeType& other) { frame::swap_whole(*this, other); }
void ShapeType::make_room_for(ShapeType const&) {}
void ShapeType::exchange([[maybe_unused]] ShapeType& other) noexcept {
    m_Area.swap(other.m_Area);
}
void ShapeType::reset() { frame::reset_by_swap(*this); }
bool ShapeType::is_occurs_ok() const { return true; }

namespace {
constexpr char k_ShapeType_id[] = "ShapeType";
}  // namespace
char const* ShapeType::id = k_ShapeType_id;
ShapeType* ShapeType::clone() const { return new ShapeType(*this); }
char const* ShapeType::getid() const { return id; }
bool ShapeType::has_id(char const* identity) const { return identity == id; }

namespace {
constexpr frame::family_member<ShapeType> k_ShapeType_family[] = {
    {&CircleType::id, &frame::make<ShapeType, CircleType>},
    {&SquareType::id, &frame::make<ShapeType, SquareType>},
};
}  // namespace
ShapeType* ShapeType::factory(int ns_id, std::string const& type_name) {
    return frame::make_by_name(k_ShapeType_family, ns_id, type_name);
}

qbxV2::eqbx_error ShapeType::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name,
                          {.declares_namespaces = true, .id = ShapeType::id, .xsi_type = "Vrl:ShapeType"});
}
qbxV2::eqbx_error ShapeType::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

double ShapeType::get_Area() const { return m_Area.value; }
qbxV2::eqbx_error ShapeType::set_Area(double value) { return frame::set(m_Area, value, k_any); }
bool ShapeType::isset_Area() const { return m_Area.set; }
void ShapeType::unset_Area() { m_Area.set = false; }

bool ShapeType::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error ShapeType::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool ShapeType::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_ShapeType_children, k_ShapeType_next);
    in.begin({0, 1});
    in.optional(0, m_Area, k_any);
    return in.done();
}

void ShapeType::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error ShapeType::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.optional(m_Area, "Vrl:Area");
    return w.result();
}

// Plate

Plate::Plate() = default;
Plate::Plate([[maybe_unused]] Plate const& other) {
    frame::copy_required(m_Shape, other.m_Shape);
    m_Hole.copy_from(other.m_Hole);
    frame::copy_optional(m_Thickness, other.m_Thickness, k_any);
}
Plate& Plate::operator=(Plate const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Plate::~Plate() = default;

void Plate::swap(Plate& other) { frame::swap_whole(*this, other); }
void Plate::make_room_for(Plate const& other) {
    m_Shape.make_room_for(other.m_Shape);
}
void Plate::exchange([[maybe_unused]] Plate& other) noexcept {
    m_Shape.exchange(other.m_Shape);
    m_Hole.swap(other.m_Hole);
    m_Thickness.swap(other.m_Thickness);
}
void Plate::reset() { frame::reset_by_swap(*this); }
bool Plate::is_occurs_ok() const { return frame::has_chosen(m_Shape); }

qbxV2::eqbx_error Plate::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Plate::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

sg_Shape const& Plate::get_Shape() const { return m_Shape.get(); }
sg_Shape& Plate::get_Shape() { return m_Shape.get(); }
sg_Shape& Plate::assign_Shape(sg_Shape const& value) { return m_Shape.assign(value); }

unsigned Plate::size_Hole() const { return m_Hole.size(); }
sg_Hole const& Plate::get_Hole(unsigned i) const { return m_Hole.get(i); }
sg_Hole& Plate::get_Hole(unsigned i) { return m_Hole.reach(i); }
sg_Hole& Plate::back_Hole() { return m_Hole.back(); }
sg_Hole& Plate::assign_Hole(unsigned i, sg_Hole const& value) {
    frame::assign_by_swap(m_Hole.reach(i), value);
    return m_Hole.reach(i);
}
qbxV2::eqbx_error Plate::append_Hole() {
    m_Hole.append();
    return qbxV2::EQBX_NO_ERROR;
}
qbxV2::eqbx_error Plate::insert_Hole(unsigned i) {
    m_Hole.insert(i);
    return qbxV2::EQBX_NO_ERROR;
}
void Plate::delete_Hole(unsigned i) { m_Hole.erase(i); }
void Plate::clear_Hole() { m_Hole.clear(); }

double Plate::get_Thickness() const { return m_Thickness.value; }
qbxV2::eqbx_error Plate::set_Thickness(double value) { return frame::set(m_Thickness, value, k_any); }
bool Plate::isset_Thickness() const { return m_Thickness.set; }
void Plate::unset_Thickness() { m_Thickness.set = false; }

bool Plate::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error Plate::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Plate::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Plate_children, k_Plate_next);
    in.begin({0, 1});
    in.group(0, m_Shape);
    in.groups(1, m_Hole);
    in.optional(2, m_Thickness, k_any);
    return in.done();
}

void Plate::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Plate::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.required_group(m_Shape);
    w.groups(m_Hole);
    w.optional(m_Thickness, "Vrl:Thickness");
    return w.result();
}

// Cover

Cover::Cover() = default;
Cover::Cover([[maybe_unused]] Cover const& other) {
    m_Shape.copy_from(other.m_Shape);
    frame::copy_optional(m_Hole, other.m_Hole);
}
Cover& Cover::operator=(Cover const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
Cover::~Cover() = default;

void Cover::swap(Cover& other) { frame::swap_whole(*this, other); }
void Cover::make_room_for(Cover const& other) {
    m_Hole.make_room_for(other.m_Hole);
}
void Cover::exchange([[maybe_unused]] Cover& other) noexcept {
    m_Shape.swap(other.m_Shape);
    m_Hole.exchange(other.m_Hole);
}
void Cover::reset() { frame::reset_by_swap(*this); }
bool Cover::is_occurs_ok() const { return !m_Shape.empty(); }

qbxV2::eqbx_error Cover::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name, {.declares_namespaces = true});
}
qbxV2::eqbx_error Cover::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

unsigned Cover::size_Shape() const { return m_Shape.size(); }
sg_Shape const& Cover::get_Shape(unsigned i) const { return m_Shape.get(i); }
sg_Shape& Cover::get_Shape(unsigned i) { return m_Shape.reach(i); }
sg_Shape& Cover::back_Shape() { return m_Shape.back(); }
sg_Shape& Cover::assign_Shape(unsigned i, sg_Shape const& value) {
    frame::assign_by_swap(m_Shape.reach(i), value);
    return m_Shape.reach(i);
}
qbxV2::eqbx_error Cover::append_Shape() {
    m_Shape.append();
    return qbxV2::EQBX_NO_ERROR;
}
qbxV2::eqbx_error Cover::insert_Shape(unsigned i) {
    m_Shape.insert(i);
    return qbxV2::EQBX_NO_ERROR;
}
void Cover::delete_Shape(unsigned i) { m_Shape.erase(i); }
void Cover::clear_Shape() { m_Shape.clear(); }

sg_Hole const& Cover::get_Hole() const { return m_Hole.get(); }
sg_Hole& Cover::get_Hole() { return m_Hole.get(); }
sg_Hole& Cover::assign_Hole(sg_Hole const& value) { return m_Hole.assign(value); }
bool Cover::isset_Hole() const { return m_Hole.is_set(); }
void Cover::unset_Hole() { m_Hole.unset(); }

bool Cover::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) {
    return false;
}

qbxV2::eqbx_error Cover::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }

bool Cover::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_Cover_children, k_Cover_next);
    in.begin({0, 1});
    in.groups(0, m_Shape);
    in.group(1, m_Hole);
    in.lists_filled(!m_Shape.empty(), "Vrl:Cover");
    return in.done();
}

void Cover::marshal_attributes(qbxV2::c_xml_writer&) const {}

qbxV2::eqbx_error Cover::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    w.groups(m_Shape);
    w.optional_group(m_Hole);
    return w.result();
}

// sg_Shape

namespace {

constexpr qbxV2::s_event_map k_sg_Shape_names[] = {
    {k_document_namespace_id, "Shape", 5, token::e_Shape},
    {k_document_namespace_id, "Circle", 6, token::e_Circle},
    {k_document_namespace_id, "Square", 6, token::e_Square},
};

constexpr frame::group_member<ShapeType> k_sg_Shape_members[] = {
    {"Vrl:Shape", nullptr},
    {"Vrl:Circle", &frame::make<ShapeType, CircleType>},
    {"Vrl:Square", &frame::make<ShapeType, SquareType>},
};

}  // namespace

sg_Shape::sg_Shape() : m_held(chosen_none) {}
sg_Shape::sg_Shape(sg_Shape const& other) : m_held(chosen_none) { m_held.copy_from(other.m_held); }
sg_Shape& sg_Shape::operator=(sg_Shape const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
sg_Shape::~sg_Shape() = default;
void sg_Shape::swap(sg_Shape& other) { frame::swap_whole(*this, other); }
// What is held moves as it stands.
void sg_Shape::make_room_for(sg_Shape const&) {}
void sg_Shape::exchange(sg_Shape& other) noexcept { m_held.swap(other.m_held); }
void sg_Shape::reset() { frame::reset_by_swap(*this); }
bool sg_Shape::is_occurs_ok() const { return !m_held.is_none(); }
qbxV2::eqbx_error sg_Shape::marshal(qbxV2::c_xml_writer& out, char const*) const {
    return is_occurs_ok() ? marshal_child_elements(out) : qbxV2::EQBX_OCCURS_ERROR_ON_MARSHAL;
}
qbxV2::eqbx_error sg_Shape::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    return frame::marshal_group(m_held, k_sg_Shape_members, "Vrl:sg_Shape", out, k_source);
}
bool sg_Shape::is_member(qbxV2::c_xml_reader& reader, std::string const&) {
    return frame::is_group_member(reader, k_sg_Shape_names);
}
bool sg_Shape::unmarshal(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    return frame::unmarshal_group(m_held, k_sg_Shape_members, k_sg_Shape_names, reader, name, error,
                                  k_source);
}
ShapeType const& sg_Shape::get_Shape() const { return m_held.as<ShapeType>(chosen_Shape); }
ShapeType& sg_Shape::get_Shape() { return m_held.become<ShapeType>(chosen_Shape); }
ShapeType& sg_Shape::assign_Shape(ShapeType const& value) {
    return m_held.assign<ShapeType>(chosen_Shape, value);
}
CircleType const& sg_Shape::get_Circle() const { return m_held.as<CircleType>(chosen_Circle); }
CircleType& sg_Shape::get_Circle() { return m_held.become<CircleType>(chosen_Circle); }
CircleType& sg_Shape::assign_Circle(CircleType const& value) {
    return m_held.assign<CircleType>(chosen_Circle, value);
}
SquareType const& sg_Shape::get_Square() const { return m_held.as<SquareType>(chosen_Square); }
SquareType& sg_Shape::get_Square() { return m_held.become<SquareType>(chosen_Square); }
SquareType& sg_Shape::assign_Square(SquareType const& value) {
    return m_held.assign<SquareType>(chosen_Square, value);
}

// sg_Hole

namespace {

constexpr qbxV2::s_event_map k_sg_Hole_names[] = {
    {k_document_namespace_id, "RoundHole", 9, token::e_RoundHole},
};

constexpr frame::group_member<ShapeType> k_sg_Hole_members[] = {
    {"Vrl:RoundHole", &frame::make<ShapeType, CircleType>},
};

}  // namespace

sg_Hole::sg_Hole() : m_held(chosen_none) {}
sg_Hole::sg_Hole(sg_Hole const& other) : m_held(chosen_none) { m_held.copy_from(other.m_held); }
sg_Hole& sg_Hole::operator=(sg_Hole const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
sg_Hole::~sg_Hole() = default;
void sg_Hole::swap(sg_Hole& other) { frame::swap_whole(*this, other); }
// What is held moves as it stands.
void sg_Hole::make_room_for(sg_Hole const&) {}
void sg_Hole::exchange(sg_Hole& other) noexcept { m_held.swap(other.m_held); }
void sg_Hole::reset() { frame::reset_by_swap(*this); }
bool sg_Hole::is_occurs_ok() const { return !m_held.is_none(); }
qbxV2::eqbx_error sg_Hole::marshal(qbxV2::c_xml_writer& out, char const*) const {
    return is_occurs_ok() ? marshal_child_elements(out) : qbxV2::EQBX_OCCURS_ERROR_ON_MARSHAL;
}
qbxV2::eqbx_error sg_Hole::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    return frame::marshal_group(m_held, k_sg_Hole_members, "Vrl:sg_Hole", out, k_source);
}
bool sg_Hole::is_member(qbxV2::c_xml_reader& reader, std::string const&) {
    return frame::is_group_member(reader, k_sg_Hole_names);
}
bool sg_Hole::unmarshal(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    return frame::unmarshal_group(m_held, k_sg_Hole_members, k_sg_Hole_names, reader, name, error, k_source);
}
CircleType const& sg_Hole::get_RoundHole() const { return m_held.as<CircleType>(chosen_RoundHole); }
CircleType& sg_Hole::get_RoundHole() { return m_held.become<CircleType>(chosen_RoundHole); }
CircleType& sg_Hole::assign_RoundHole(CircleType const& value) {
    return m_held.assign<CircleType>(chosen_RoundHole, value);
}

// CircleType

CircleType::CircleType() = default;
CircleType::CircleType([[maybe_unused]] CircleType const& other) : ShapeType(other) {
}
CircleType& CircleType::operator=(CircleType const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
CircleType::~CircleType() = default;

void CircleType::swap(CircleType& other) { frame::swap_whole(*this, other); }
void CircleType::make_room_for(CircleType const& other) {
    ShapeType::make_room_for(other);
}
void CircleType::exchange([[maybe_unused]] CircleType& other) noexcept {
    ShapeType::exchange(other);
}
void CircleType::reset() { frame::reset_by_swap(*this); }
bool CircleType::is_occurs_ok() const { return ShapeType::is_occurs_ok(); }

namespace {
constexpr char k_CircleType_id[] = "CircleType";
}  // namespace
char const* CircleType::id = k_CircleType_id;
CircleType* CircleType::clone() const { return new CircleType(*this); }
char const* CircleType::getid() const { return id; }
bool CircleType::has_id(char const* identity) const { return identity == id || ShapeType::has_id(identity); }

qbxV2::eqbx_error CircleType::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name,
                          {.declares_namespaces = true, .id = CircleType::id, .xsi_type = "Vrl:CircleType"});
}
qbxV2::eqbx_error CircleType::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

// SquareType

SquareType::SquareType() = default;
SquareType::SquareType([[maybe_unused]] SquareType const& other) : ShapeType(other) {
}
SquareType& SquareType::operator=(SquareType const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
SquareType::~SquareType() = default;

void SquareType::swap(SquareType& other) { frame::swap_whole(*this, other); }
void SquareType::make_room_for(SquareType const& other) {
    ShapeType::make_room_for(other);
}
void SquareType::exchange([[maybe_unused]] SquareType& other) noexcept {
    ShapeType::exchange(other);
}
void SquareType::reset() { frame::reset_by_swap(*this); }
bool SquareType::is_occurs_ok() const { return ShapeType::is_occurs_ok(); }

namespace {
constexpr char k_SquareType_id[] = "SquareType";
}  // namespace
char const* SquareType::id = k_SquareType_id;
SquareType* SquareType::clone() const { return new SquareType(*this); }
char const* SquareType::getid() const { return id; }
bool SquareType::has_id(char const* identity) const { return identity == id || ShapeType::has_id(identity); }

qbxV2::eqbx_error SquareType::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    return frame::marshal(*this, out, name,
                          {.declares_namespaces = true, .id = SquareType::id, .xsi_type = "Vrl:SquareType"});
}
qbxV2::eqbx_error SquareType::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    static constexpr frame::element_kind kind{.source = k_source};
    return frame::unmarshal(*this, kind, reader, name);
}

// Shape

Shape::Shape() = default;
Shape::Shape(Shape const& other) = default;
Shape& Shape::operator=(Shape const& other) = default;
Shape::~Shape() = default;
qbxV2::eqbx_error Shape::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    out.conditionally_select_ns_map(document_namespaces());
    return ShapeType::marshal(out, name);
}
qbxV2::eqbx_error Shape::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    return ShapeType::unmarshal(reader, name);
}

qbxV2::eqbx_error Shape::marshal(std::ostream& os) const {
    return frame::marshal_to_stream(frame::as_document(*this, "Vrl:Shape"), os);
}
qbxV2::eqbx_error Shape::marshal(std::string* text) const {
    return frame::marshal_to_string(frame::as_document(*this, "Vrl:Shape"), text);
}
qbxV2::eqbx_error Shape::marshal(char const* path) const {
    return frame::marshal_to_path(frame::as_document(*this, "Vrl:Shape"), path);
}
qbxV2::eqbx_error Shape::unmarshal(qbxV2::c_xml_reader& reader) {
    return frame::unmarshal_document(*this, reader, "Shape", k_source);
}
qbxV2::eqbx_error Shape::unmarshal(std::string const& text) {
    return frame::unmarshal_memory(*this, text.data(), text.size());
}
qbxV2::eqbx_error Shape::unmarshal(char const* bytes, unsigned length) {
    return frame::unmarshal_memory(*this, bytes, length);
}
qbxV2::eqbx_error Shape::unmarshal(char const* path) { return frame::unmarshal_path(*this, path); }
Shape::Shape(std::string const& text, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(text);
}
Shape::Shape(char const* bytes, unsigned length, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(bytes, length);
}
Shape::Shape(char const* path, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(path);
}

// Hole

Hole::Hole() = default;
Hole::Hole(Hole const& other) = default;
Hole& Hole::operator=(Hole const& other) = default;
Hole::~Hole() = default;
qbxV2::eqbx_error Hole::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    out.conditionally_select_ns_map(document_namespaces());
    return ShapeType::marshal(out, name);
}
qbxV2::eqbx_error Hole::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    return ShapeType::unmarshal(reader, name);
}

qbxV2::eqbx_error Hole::marshal(std::ostream& os) const {
    return frame::marshal_to_stream(frame::as_document(*this, "Vrl:Hole"), os);
}
qbxV2::eqbx_error Hole::marshal(std::string* text) const {
    return frame::marshal_to_string(frame::as_document(*this, "Vrl:Hole"), text);
}
qbxV2::eqbx_error Hole::marshal(char const* path) const {
    return frame::marshal_to_path(frame::as_document(*this, "Vrl:Hole"), path);
}
qbxV2::eqbx_error Hole::unmarshal(qbxV2::c_xml_reader& reader) {
    return frame::unmarshal_document(*this, reader, "Hole", k_source);
}
qbxV2::eqbx_error Hole::unmarshal(std::string const& text) {
    return frame::unmarshal_memory(*this, text.data(), text.size());
}
qbxV2::eqbx_error Hole::unmarshal(char const* bytes, unsigned length) {
    return frame::unmarshal_memory(*this, bytes, length);
}
qbxV2::eqbx_error Hole::unmarshal(char const* path) { return frame::unmarshal_path(*this, path); }
Hole::Hole(std::string const& text, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(text);
}
Hole::Hole(char const* bytes, unsigned length, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(bytes, length);
}
Hole::Hole(char const* path, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(path);
}

// Circle

Circle::Circle() = default;
Circle::Circle(Circle const& other) = default;
Circle& Circle::operator=(Circle const& other) = default;
Circle::~Circle() = default;
qbxV2::eqbx_error Circle::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    out.conditionally_select_ns_map(document_namespaces());
    return CircleType::marshal(out, name);
}
qbxV2::eqbx_error Circle::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    return CircleType::unmarshal(reader, name);
}

qbxV2::eqbx_error Circle::marshal(std::ostream& os) const {
    return frame::marshal_to_stream(frame::as_document(*this, "Vrl:Circle"), os);
}
qbxV2::eqbx_error Circle::marshal(std::string* text) const {
    return frame::marshal_to_string(frame::as_document(*this, "Vrl:Circle"), text);
}
qbxV2::eqbx_error Circle::marshal(char const* path) const {
    return frame::marshal_to_path(frame::as_document(*this, "Vrl:Circle"), path);
}
qbxV2::eqbx_error Circle::unmarshal(qbxV2::c_xml_reader& reader) {
    return frame::unmarshal_document(*this, reader, "Circle", k_source);
}
qbxV2::eqbx_error Circle::unmarshal(std::string const& text) {
    return frame::unmarshal_memory(*this, text.data(), text.size());
}
qbxV2::eqbx_error Circle::unmarshal(char const* bytes, unsigned length) {
    return frame::unmarshal_memory(*this, bytes, length);
}
qbxV2::eqbx_error Circle::unmarshal(char const* path) { return frame::unmarshal_path(*this, path); }
Circle::Circle(std::string const& text, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(text);
}
Circle::Circle(char const* bytes, unsigned length, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(bytes, length);
}
Circle::Circle(char const* path, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(path);
}

// Square

Square::Square() = default;
Square::Square(Square const& other) = default;
Square& Square::operator=(Square const& other) = default;
Square::~Square() = default;
qbxV2::eqbx_error Square::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    out.conditionally_select_ns_map(document_namespaces());
    return SquareType::marshal(out, name);
}
qbxV2::eqbx_error Square::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    return SquareType::unmarshal(reader, name);
}

qbxV2::eqbx_error Square::marshal(std::ostream& os) const {
    return frame::marshal_to_stream(frame::as_document(*this, "Vrl:Square"), os);
}
qbxV2::eqbx_error Square::marshal(std::string* text) const {
    return frame::marshal_to_string(frame::as_document(*this, "Vrl:Square"), text);
}
qbxV2::eqbx_error Square::marshal(char const* path) const {
    return frame::marshal_to_path(frame::as_document(*this, "Vrl:Square"), path);
}
qbxV2::eqbx_error Square::unmarshal(qbxV2::c_xml_reader& reader) {
    return frame::unmarshal_document(*this, reader, "Square", k_source);
}
qbxV2::eqbx_error Square::unmarshal(std::string const& text) {
    return frame::unmarshal_memory(*this, text.data(), text.size());
}
qbxV2::eqbx_error Square::unmarshal(char const* bytes, unsigned length) {
    return frame::unmarshal_memory(*this, bytes, length);
}
qbxV2::eqbx_error Square::unmarshal(char const* path) { return frame::unmarshal_path(*this, path); }
Square::Square(std::string const& text, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(text);
}
Square::Square(char const* bytes, unsigned length, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(bytes, length);
}
Square::Square(char const* path, qbxV2::eqbx_error* error) {
    *error = qbxV2::EQBX_UNDEFINED_ERROR;
    *error = unmarshal(path);
}

// RoundHole

RoundHole::RoundHole() = default;
RoundHole::RoundHole(RoundHole const& other) = default;
RoundHole& RoundHole::operator=(RoundHole const& other) = default;
RoundHole::~RoundHole() = default;
qbxV2::eqbx_error RoundHole::marshal(qbxV2::c_xml_writer& out, char const* name) const {
    out.conditionally_select_ns_map(document_namespaces());
    return CircleType::marshal(out, name);
}
qbxV2::eqbx_error RoundHole::unmarshal(qbxV2::c_xml_reader& reader, std::string const& name) {
    return CircleType::unmarshal(reader, name);
}

}  // namespace vrl_v2
