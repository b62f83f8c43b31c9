#include "codegen/emit.h"

namespace vrl_codegen {
namespace {

void define_attribute_writing(printer& out, const class_plan& made) {
    if (made.attributes().empty()) {
        if (made.base.empty()) out.print("\nvoid $C$::marshal_attributes(qbxV2::c_xml_writer&) const {}\n");
        return;
    }
    out.print("\nvoid $C$::marshal_attributes(qbxV2::c_xml_writer& out) const {\n");
    if (!made.base.empty()) out.print("    $base$::marshal_attributes(out);\n", {{"base", made.base}});
    out.print("    frame::attributes_writer w(out);\n");
    for (const member_plan* member : made.attributes()) {
        out.print("    w.$how$(m_$X$, \"$X$\");\n",
                  {{"how", member->always_written ? "always" : "if_set"}, {"X", member->name}});
    }
    out.print("}\n");
}

std::string writing_call(const member_plan& member) {
    const std::string stored = "m_" + member.name;
    const std::string named = stored + ", \"Vrl:" + member.name + "\"";
    const std::string need = member.required ? "required" : "optional";
    switch (member.kind) {
        case member_kind::value:
        case member_kind::object:
            return need + "(" + named + ")";
        case member_kind::group:
            return need + "_group(" + stored + ")";
        case member_kind::value_list:
            return "repeated_values(" + named + ")";
        case member_kind::object_list:
            return "repeated(" + named + ")";
        case member_kind::group_list:
            return "groups(" + stored + ")";
        default:
            return "";
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
        out.print(
            R"(        case chosen_$X$:
            w.$what$(m_$X$.get(), "Vrl:$X$");
            break;
)",
            {{"X", member->name}, {"what", member->kind == member_kind::value_option ? "value" : "object"}});
    }
    out.print(
        R"(        default:
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
    if (made.base.empty()) {
        out.print("    frame::children_writer w(out);\n");
    } else {
        out.print("    frame::children_writer w(out, $base$::marshal_child_elements(out));\n",
                  {{"base", made.base}});
    }
    for (const member_plan* member : made.children()) {
        out.print("    w.$call$;\n", {{"call", writing_call(*member)}});
    }
    out.print("    return w.result();\n}\n");
}

}  // namespace

void define_writing(printer& out, const class_plan& made) {
    define_attribute_writing(out, made);
    const auto children = made.children();
    if (made.text() != nullptr) {
        define_text_writing(out, made);
    } else if (made.kind == class_kind::choice) {
        define_choice_writing(out, made);
    } else if (!children.empty() && children.front()->kind == member_kind::any_list) {
        define_any_writing(out);
    } else if (!children.empty()) {
        define_children_writing(out, made);
    }
}

}  // namespace vrl_codegen
