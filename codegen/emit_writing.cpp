#include "codegen/emit_class.h"

namespace vrl_codegen {
namespace {

void define_attribute_writing(printer& out, const class_plan& made) {
    if (!made.has_own_attributes()) return;
    const std::vector<const member_plan*> attributes = made.attributes();
    if (attributes.empty()) {
        out.print("\nvoid $C$::marshal_attributes(qbxV2::c_xml_writer&) const {}\n");
        return;
    }
    out.print("\nvoid $C$::marshal_attributes(qbxV2::c_xml_writer& out) const {\n");
    if (!made.base.empty()) out.print("    $base$::marshal_attributes(out);\n");
    out.print("    frame::attributes_writer w(out);\n");
    for (const member_plan* member : attributes) {
        out.print(
            member->always_written ? "    w.always(m_$X$, \"$X$\");\n" : "    w.if_set(m_$X$, \"$X$\");\n",
            {{"X", member->name}});
    }
    out.print("}\n");
}

std::string writing_call(const member_plan& member) {
    switch (member.kind) {
        case member_kind::value:
        case member_kind::object:
            return member.required ? "required(m_$X$, \"Vrl:$X$\")" : "optional(m_$X$, \"Vrl:$X$\")";
        case member_kind::group:
            return member.required ? "required_group(m_$X$)" : "optional_group(m_$X$)";
        case member_kind::value_list:
            return "repeated_values(m_$X$, \"Vrl:$X$\")";
        case member_kind::object_list:
            return "repeated(m_$X$, \"Vrl:$X$\")";
        case member_kind::group_list:
            return "groups(m_$X$)";
        default:
            return {};
    }
}

void define_text_writing(printer& out, const class_plan& made) {
    out.print(R"(
qbxV2::eqbx_error $C$::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    if (m_$X$.set) frame::put_value(out, m_$X$.value);
    return qbxV2::EQBX_NO_ERROR;
}
)",
              {{"X", made.text()->name}});
}

void define_choice_writing(printer& out, const class_plan& made) {
    out.print(R"(
qbxV2::eqbx_error $C$::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    switch (m_chosen) {
)");
    for (const member_plan* member : made.children()) {
        const printer_scope scope(out, {{"X", member->name}});
        out.print("        case chosen_$X$:\n");
        out.print(member->kind == member_kind::value_option
                      ? "            w.value(m_$X$.get(), \"Vrl:$X$\");\n"
                      : "            w.object(m_$X$.get(), \"Vrl:$X$\");\n");
        out.print("            break;\n");
    }
    out.print(R"(        default:
            return out.handle_error(qbxV2::EQBX_BAD_CHOICE, "Vrl:$C$", k_source, __LINE__);
    }
    return w.result();
}
)");
}

void define_any_writing(printer& out) {
    out.print(R"(
qbxV2::eqbx_error $C$::marshal_child_elements(qbxV2::c_xml_writer& out) const {
    frame::children_writer w(out);
    for (const qbxV2::c_any_info* entry : m_any) w.raw(entry->get_value());
    return w.result();
}
)");
}

void define_children_writing(printer& out, const class_plan& made) {
    out.print("\nqbxV2::eqbx_error $C$::marshal_child_elements(qbxV2::c_xml_writer& out) const {\n");
    out.print(made.base.empty()
                  ? "    frame::children_writer w(out);\n"
                  : "    frame::children_writer w(out, $base$::marshal_child_elements(out));\n");
    for (const member_plan* member : made.children()) {
        out.print("    w." + writing_call(*member) + ";\n", {{"X", member->name}});
    }
    out.print("    return w.result();\n}\n");
}

void define_content_writing(printer& out, const class_plan& made) {
    switch (made.content) {
        case content_kind::text:
            define_text_writing(out, made);
            break;
        case content_kind::children:
            define_children_writing(out, made);
            break;
        case content_kind::choice:
            define_choice_writing(out, made);
            break;
        case content_kind::any:
            define_any_writing(out);
            break;
        case content_kind::none:
            out.print(R"(
qbxV2::eqbx_error $C$::marshal_child_elements(qbxV2::c_xml_writer&) const { return qbxV2::EQBX_NO_ERROR; }
)");
            break;
    }
}

}  // namespace

void define_writing(printer& out, const class_plan& made) {
    define_attribute_writing(out, made);
    if (made.has_own_content()) define_content_writing(out, made);
}

}  // namespace vrl_codegen
