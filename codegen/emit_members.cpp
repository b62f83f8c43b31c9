#include "codegen/emit_members.h"

namespace vrl_codegen {
namespace {

printer::values holes_of(const member_plan& member) {
    return {{"X", member.name},
            {"type", member.value.type},
            {"in", member.value.parameter},
            {"limits", member.value.limits},
            {"class", member.class_name}};
}

}  // namespace

void declare_presence(printer& out, const member_plan& member) {
    if (!member.has_presence_accessors()) return;
    out.print("    bool isset_$X$() const;\n    void unset_$X$();\n");
}

void declare_accessors(printer& out, const member_plan& member) {
    const printer_scope scope(out, holes_of(member));
    out.print("\n");
    out.print(comment(member.documentation, "    "));
    switch (member.kind) {
        case member_kind::attribute:
        case member_kind::text:
        case member_kind::value:
        case member_kind::value_option:
            declare_value(out, member);
            break;
        case member_kind::object:
        case member_kind::group:
        case member_kind::object_option:
            declare_object(out, member);
            break;
        case member_kind::value_list:
            declare_value_list(out);
            break;
        case member_kind::object_list:
        case member_kind::group_list:
            declare_object_list(out);
            break;
        case member_kind::any_list:
            declare_any_list(out);
            break;
    }
}

void declare_storage(printer& out, const member_plan& member) {
    const printer_scope scope(out, holes_of(member));
    switch (member.kind) {
        case member_kind::attribute:
        case member_kind::text:
        case member_kind::value:
            out.print("    frame::single<$type$> m_$X$;\n");
            break;
        case member_kind::object:
        case member_kind::group:
            out.print("    frame::child<$class$> m_$X$;\n");
            break;
        case member_kind::value_list:
            out.print("    frame::list<$type$> m_$X$;\n");
            break;
        case member_kind::object_list:
        case member_kind::group_list:
            out.print("    frame::list<$class$> m_$X$;\n");
            break;
        case member_kind::any_list:
            out.print("    frame::list<qbxV2::c_any_info> m_any;\n");
            break;
        case member_kind::value_option:
            out.print("    frame::option<$type$> m_$X$;\n");
            break;
        case member_kind::object_option:
            out.print("    frame::option<$class$> m_$X$;\n");
            break;
    }
}

void define_accessors(printer& out, const member_plan& member) {
    const printer_scope scope(out, holes_of(member));
    out.print("\n");
    switch (member.kind) {
        case member_kind::attribute:
        case member_kind::text:
        case member_kind::value:
            define_value(out, member);
            break;
        case member_kind::object:
        case member_kind::group:
            define_object(out, member);
            break;
        case member_kind::value_list:
            define_value_list(out);
            break;
        case member_kind::object_list:
        case member_kind::group_list:
            define_object_list(out);
            break;
        case member_kind::any_list:
            define_any_list(out);
            break;
        case member_kind::value_option:
            define_value_option(out, member);
            break;
        case member_kind::object_option:
            define_object_option(out);
            break;
    }
}

}  // namespace vrl_codegen
