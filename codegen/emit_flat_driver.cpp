#include "codegen/emit.h"

/// The driver of the flat layer's tests: for each member the C functions that serve it, in one table.
namespace vrl_codegen {
namespace {

void bind(printer& out, const char* field, const std::string& function) {
    out.print("        m.$field$ = &CSharp_$C$_$function$;\n", {{"field", field}, {"function", function}});
}

void bind_list(printer& out, const std::string& name) {
    bind(out, "size", "size_" + name);
    bind(out, "erase", "delete_" + name);
    bind(out, "clear", "clear_" + name);
}

/// The functions that take a value by pointer, given none.
void bind_nulls(printer& out, const member_plan& member) {
    const printer::values holes = {{"X", member.name}};
    if (member.kind != member_kind::value_list && member.kind != member_kind::any_list) {
        out.print("        m.given_null = {[](void* o) { return CSharp_$C$_set_$X$(o, nullptr); }};\n",
                  holes);
        return;
    }
    out.print(R"(        m.given_null = {[](void* o) { return CSharp_$C$_append_$X$(o, nullptr); },
                        [](void* o) { return CSharp_$C$_insert_$X$(o, 0, nullptr); }};
)",
              holes);
    if (member.kind == member_kind::any_list) return;
    out.print("        m.given_null.push_back([](void* o) { return CSharp_$C$_set_$X$(o, 0, nullptr); });\n",
              holes);
}

/// What crosses differs by type: the text of a document on one side, the C type on the other.
void bind_value(printer& out, const member_plan& member) {
    const bool list = member.kind == member_kind::value_list;
    const bool structured =
        member.value.kind == value_kind::date_time || member.value.kind == value_kind::binary;
    const printer::values holes = {
        {"X", member.name}, {"taken", structured ? "text_of<" + member.value.type + ">" : "taken_text"}};
    if (structured || member.value.kind == value_kind::text) bind_nulls(out, member);
    if (list) {
        out.print(R"(        m.set = [](void* o, const std::string& t) {
            return CSharp_$C$_append_$X$(o, crossing_value(t, &CSharp_$C$_append_$X$).get());
        };
        m.get = [](void* o, uint32_t i) { return $taken$(CSharp_$C$_get_$X$(o, i)); };
        m.insert = [](void* o, uint32_t i, const std::string& t) {
            return CSharp_$C$_insert_$X$(o, i, crossing_value(t, &CSharp_$C$_append_$X$).get());
        };
        m.set_at = [](void* o, uint32_t i, const std::string& t) {
            return CSharp_$C$_set_$X$(o, i, crossing_value(t, &CSharp_$C$_append_$X$).get());
        };
)",
                  holes);
        bind_list(out, member.name);
        return;
    }
    out.print(R"(        m.set = [](void* o, const std::string& t) {
            return CSharp_$C$_set_$X$(o, crossing_value(t, &CSharp_$C$_set_$X$).get());
        };
        m.get = [](void* o, uint32_t) { return $taken$(CSharp_$C$_get_$X$(o)); };
)",
              holes);
    if (member.value.facet.enumeration.empty()) return;
    bind(out, "getenum", "getenum_" + member.name);
    bind(out, "setenum", "setenum_" + member.name);
}

void bind_object(printer& out, const std::string& name, bool list) {
    const printer::values holes = {{"X", name}};
    if (!list) {
        out.print(R"(        m.reach = [](void* o, uint32_t) { return CSharp_$C$_get_$X$__SWIG_0(o); };
        m.assign = [](void* o, uint32_t, void* v) { return CSharp_$C$_assign_$X$(o, v); };
)",
                  holes);
        return;
    }
    bind(out, "reach", "get_" + name + "__SWIG_0");
    bind(out, "assign", "assign_" + name);
    bind(out, "back", "back_" + name);
    bind(out, "append", "append_" + name);
    bind(out, "insert_object", "insert_" + name);
    bind_list(out, name);
}

void bind_any(printer& out, const member_plan& member) {
    out.print(
        R"(        m.set = [](void* o, const std::string& t) { return CSharp_$C$_append_any(o, t.c_str()); };
        m.get = [](void* o, uint32_t i) { return taken_text(vrl_revision_any(o, i, 2)); };
        m.insert = [](void* o, uint32_t i, const std::string& t) {
            return CSharp_$C$_insert_any(o, i, t.c_str());
        };
)");
    bind_nulls(out, member);
    bind_list(out, member.name);
}

void bind_member(printer& out, const member_plan& member) {
    out.print("    {\n        flat_member m;\n        m.name = \"$X$\";\n", {{"X", member.name}});
    switch (member.kind) {
        case member_kind::attribute:
        case member_kind::text:
        case member_kind::value:
        case member_kind::value_option:
        case member_kind::value_list:
            bind_value(out, member);
            break;
        case member_kind::object:
        case member_kind::group:
        case member_kind::object_option:
            bind_object(out, member.name, false);
            break;
        case member_kind::object_list:
        case member_kind::group_list:
            bind_object(out, member.name, true);
            break;
        case member_kind::any_list:
            bind_any(out, member);
            break;
    }
    if (member.has_presence_accessors()) {
        bind(out, "isset", "isset_" + member.name);
        bind(out, "unset", "unset_" + member.name);
    }
    out.print("        c.members.push_back(m);\n    }\n");
}

void bind_class(printer& out, const class_plan& made) {
    out.print(R"(
flat_class bind_$C$() {
    flat_class c;
    c.name = "$C$";
    c.create = &CSharp_new_$C$__SWIG_0;
    c.copy = &CSharp_new_$C$__SWIG_1;
    c.destroy = &CSharp_delete_$C$;
)");
    const auto field = [&out](const char* name, const std::string& function) {
        out.print("    c.$field$ = &CSharp_$function$;\n", {{"field", name}, {"function", function}});
    };
    if (!made.base.empty()) field("upcast", made.name + "Upcast");
    if (made.declares_members) {
        field("swap", made.name + "_swap");
        field("reset", made.name + "_reset");
        field("is_occurs_ok", made.name + "_is_occurs_ok");
    }
    if (made.kind == class_kind::choice || made.kind == class_kind::group) {
        field("getchosen", made.name + "_getchosen");
    }
    if (made.nillable) {
        field("isnil", made.name + "_isnil_" + made.name);
        field("setnil", made.name + "_setnil_" + made.name);
    }
    if (made.standalone) {
        field("marshal", made.name + "_marshal__SWIG_0");
        field("unmarshal_path", made.name + "_unmarshal__SWIG_0");
        field("unmarshal_bytes", made.name + "_unmarshal__SWIG_1");
    }
    if (made.polymorphic && made.kind == class_kind::type) {
        field("clone", made.name + "_clone");
        field("getid", made.name + "_getid");
        field("has_id", made.name + "_has_id");
        field("id_get", made.name + "_id_get");
        field("id_set", made.name + "_id_set");
    }
    if (!made.factory.empty()) field("factory", made.name + "_factory");
    for (const group_member_plan& member : made.group) {
        out.print(
            "    {\n        flat_member m;\n        m.name = \"$X$\";\n        m.class_name = \"$T$\";\n",
            {{"X", member.element}, {"T", member.class_name}});
        bind_object(out, member.element, false);
        out.print("        c.members.push_back(m);\n    }\n");
    }
    for (const member_plan& member : made.members) bind_member(out, member);
    out.print("    return c;\n}\n");
}

}  // namespace

std::string emit_flat_driver(const module_plan& module) {
    printer out;
    out.print(R"(// Generated from schema/$module$.xsd. To change it, change the schema.
#include "tests/flat/flat_driver.h"

namespace vrl_flat_driver {
namespace {
)",
              {{"module", module.name}});
    for (const class_plan* made : module.classes) {
        const printer_scope scope(out, {{"C", made->name}});
        bind_class(out, *made);
    }
    out.print("\n}  // namespace\n\nvoid bind_$module$(std::vector<flat_class>& all) {\n",
              {{"module", module.name}});
    for (const class_plan* made : module.classes) {
        out.print("    all.push_back(bind_$C$());\n", {{"C", made->name}});
    }
    out.print("}\n\n}  // namespace vrl_flat_driver\n");
    return out.text();
}

std::string emit_flat_driver_list(const plan& model) {
    printer out;
    out.print(R"(// Generated from schema/. To change it, change the schema.
#include "tests/flat/flat_driver.h"

namespace vrl_flat_driver {

)");
    for (const module_plan& module : model.modules) {
        out.print("void bind_$it$(std::vector<flat_class>& all);\n", {{"it", module.name}});
    }
    out.print(R"(
const std::vector<flat_class>& flat_classes() {
    static const std::vector<flat_class> all = [] {
        std::vector<flat_class> made;
)");
    for (const module_plan& module : model.modules) {
        out.print("        bind_$it$(made);\n", {{"it", module.name}});
    }
    out.print("        return made;\n    }();\n    return all;\n}\n\n}  // namespace vrl_flat_driver\n");
    return out.text();
}

}  // namespace vrl_codegen
