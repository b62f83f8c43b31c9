#include "codegen/emit_class.h"

namespace vrl_codegen {
namespace {

printer::values holes_of(const group_member_plan& member) {
    return {{"M", member.element}, {"type", member.class_name}};
}

}  // namespace

void declare_group(printer& out, const class_plan& made) {
    out.print("class VRL_API $C$ {\npublic:\n");
    std::vector<std::string> names;
    for (const group_member_plan& member : made.group) names.push_back(member.element);
    declare_states(out, names, made.none_state);
    out.print(R"(    eqbx_chosen getchosen() const { return static_cast<eqbx_chosen>(m_held.state()); }

    $C$();
    $C$($C$ const& other);
    $C$& operator=($C$ const& other);
    virtual ~$C$();

    void swap($C$& other);
    void reset();
    bool is_occurs_ok() const;
    /// Writes the held object under its own element's name, whatever `name` is.
    qbxV2::eqbx_error marshal(qbxV2::c_xml_writer& out, char const* name) const;
    /// Whether the reader stands on an element of this group; leaves its event alone if not.
    static bool is_member(qbxV2::c_xml_reader& reader, std::string const& name);
    /// Reads the element of this group that the reader stands on, and moves behind it.
    bool unmarshal(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error);

    /// A mutable reference, and assigning, make the group hold that member.
)");
    for (const group_member_plan& member : made.group) {
        const printer_scope scope(out, holes_of(member));
        out.print(R"(    $type$ const& get_$M$() const;
    $type$& get_$M$();
    $type$& assign_$M$($type$ const& value);
)");
    }
    out.print(R"(
protected:
    friend struct frame::access;
    void make_room_for($C$ const& other);
    void exchange($C$& other) noexcept;
    qbxV2::eqbx_error marshal_child_elements(qbxV2::c_xml_writer& out) const;

private:
    frame::held<$head$> m_held;
};

)",
              {{"head", made.head}});
}

namespace {

void define_group_tables(printer& out, const class_plan& made) {
    out.print("\nnamespace {\n\nconstexpr qbxV2::s_event_map k_$C$_names[] = {\n");
    for (const group_member_plan& member : made.group) {
        print_row(out, "k_document_namespace_id", member.element, member.token);
    }
    out.print("};\n\nconstexpr frame::group_member<$head$> k_$C$_members[] = {\n");
    for (const group_member_plan& member : made.group) {
        const printer_scope scope(out, holes_of(member));
        out.print(member.is_head ? "    {\"Vrl:$M$\", nullptr},\n"
                                 : "    {\"Vrl:$M$\", &frame::make<$head$, $type$>},\n");
    }
    out.print("};\n\n}  // namespace\n");
}

void define_group_member(printer& out, const group_member_plan& member) {
    const printer_scope scope(out, holes_of(member));
    out.print(R"($type$ const& $C$::get_$M$() const { return m_held.as<$type$>(chosen_$M$); }
$type$& $C$::get_$M$() { return m_held.become<$type$>(chosen_$M$); }
$type$& $C$::assign_$M$($type$ const& value) { return m_held.assign<$type$>(chosen_$M$, value); }
)");
}

}  // namespace

void define_group(printer& out, const class_plan& made) {
    const printer_scope scope(out, {{"head", made.head}});
    define_group_tables(out, made);
    out.print(R"(
$C$::$C$() : m_held(chosen_none) {}
$C$::$C$($C$ const& other) : m_held(chosen_none) { m_held.copy_from(other.m_held); }
$C$& $C$::operator=($C$ const& other) {
    frame::assign_by_swap(*this, other);
    return *this;
}
$C$::~$C$() = default;
void $C$::swap($C$& other) { frame::swap_whole(*this, other); }
// What is held moves as it stands.
void $C$::make_room_for($C$ const&) {}
void $C$::exchange($C$& other) noexcept { m_held.swap(other.m_held); }
void $C$::reset() { frame::reset_by_swap(*this); }
bool $C$::is_occurs_ok() const { return !m_held.is_none(); }
qbxV2::eqbx_error $C$::marshal(qbxV2::c_xml_writer& out, char const*) const {
    return is_occurs_ok() ? marshal_child_elements(out) : qbxV2::EQBX_OCCURS_ERROR_ON_MARSHAL;
}
qbxV2::eqbx_error $C$::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    return frame::marshal_group(m_held, k_$C$_members, "Vrl:$C$", out, k_source);
}
bool $C$::is_member(qbxV2::c_xml_reader& reader, std::string const&) {
    return frame::is_group_member(reader, k_$C$_names);
}
bool $C$::unmarshal(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    return frame::unmarshal_group(m_held, k_$C$_members, k_$C$_names, reader, name, error, k_source);
}
)");
    for (const group_member_plan& member : made.group) define_group_member(out, member);
}

}  // namespace vrl_codegen
