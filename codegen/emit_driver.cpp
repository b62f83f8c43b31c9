#include "codegen/emit.h"

/// The driver of the tests: the plan once more, as tables that code can walk without knowing a class.
namespace vrl_codegen {
namespace {

std::string form_of(member_kind kind) {
    switch (kind) {
        case member_kind::attribute:
            return "attribute";
        case member_kind::text:
            return "text";
        case member_kind::value:
            return "value";
        case member_kind::object:
            return "object";
        case member_kind::group:
            return "group";
        case member_kind::value_list:
            return "value_list";
        case member_kind::object_list:
            return "object_list";
        case member_kind::group_list:
            return "group_list";
        case member_kind::any_list:
            return "any_list";
        case member_kind::value_option:
            return "value_option";
        case member_kind::object_option:
            return "object_option";
    }
    return {};
}

std::string form_of(value_kind kind) {
    switch (kind) {
        case value_kind::number:
            return "number";
        case value_kind::text:
            return "text";
        case value_kind::boolean:
            return "boolean";
        case value_kind::integer:
            return "integer";
        case value_kind::unsigned_integer:
            return "unsigned_integer";
        case value_kind::byte:
            return "byte";
        case value_kind::date_time:
            return "date_time";
        case value_kind::binary:
            return "binary";
    }
    return {};
}

std::string form_of(class_kind kind) {
    switch (kind) {
        case class_kind::type:
            return "type";
        case class_kind::element:
            return "element";
        case class_kind::choice:
            return "choice";
        case class_kind::group:
            return "group";
        case class_kind::root:
            return "root";
    }
    return {};
}

void set_text(printer& out, const char* field, const std::optional<std::string>& value) {
    if (value) out.print("        m.limits.$field$ = \"$value$\";\n", {{"field", field}, {"value", *value}});
}

void describe_facets(printer& out, const facets& limits) {
    set_text(out, "min_inclusive", limits.min_inclusive);
    set_text(out, "min_exclusive", limits.min_exclusive);
    set_text(out, "max_inclusive", limits.max_inclusive);
    set_text(out, "max_exclusive", limits.max_exclusive);
    const auto length = [&out](const char* field, const std::optional<unsigned>& value) {
        if (!value) return;
        out.print("        m.limits.$field$ = $value$;\n",
                  {{"field", field}, {"value", std::to_string(*value)}});
    };
    length("min_length", limits.min_length);
    length("max_length", limits.max_length);
    std::vector<std::string> literals;
    for (const std::string& literal : limits.enumeration) literals.push_back(quoted(literal));
    if (!literals.empty())
        out.print("        m.limits.literals = {$all$};\n", {{"all", join(literals, ", ")}});
}

void describe_flags(printer& out, const member_plan& member) {
    out.print("        m.name = \"$X$\";\n        m.kind = form::$form$;\n",
              {{"form", form_of(member.kind)}});
    if (!member.value.type.empty()) {
        out.print("        m.value = value_type::$kind$;\n", {{"kind", form_of(member.value.kind)}});
    }
    const auto flag = [&out](const char* field, bool value) {
        out.print("        m.$field$ = $value$;\n", {{"field", field}, {"value", value ? "true" : "false"}});
    };
    if (member.required) flag("required", true);
    if (member.read_optional) flag("read_optional", true);
    if (!member.has_presence) flag("has_presence", false);
    if (member.always_written) flag("always_written", true);
    if (!member.class_name.empty()) out.print("        m.class_name = \"$class$\";\n");
}

void describe_simple(printer& out, const member_plan& member) {
    out.print(
        R"(        m.set = [](void* o, const std::string& t) { return static_cast<$C$*>(o)->set_$X$(value_of<$type$>(t)); };
        m.get = [](const void* o, unsigned) { return to_text(static_cast<const $C$*>(o)->get_$X$()); };
)");
    if (!member.value.facet.enumeration.empty()) {
        out.print(
            R"(        m.getenum = [](const void* o) -> int { return static_cast<const $C$*>(o)->getenum_$X$(); };
        m.setenum = [](void* o, int e) { return static_cast<$C$*>(o)->setenum_$X$(static_cast<$C$::Eenum_$X$>(e)); };
)");
    }
}

void describe_presence(printer& out) {
    out.print(R"(        m.isset = [](const void* o) { return static_cast<const $C$*>(o)->isset_$X$(); };
        m.unset = [](void* o) { static_cast<$C$*>(o)->unset_$X$(); };
)");
}

void describe_list(printer& out) {
    out.print(R"(        m.size = [](const void* o) { return static_cast<const $C$*>(o)->size_$X$(); };
        m.erase = [](void* o, unsigned i) { static_cast<$C$*>(o)->delete_$X$(i); };
        m.clear = [](void* o) { static_cast<$C$*>(o)->clear_$X$(); };
)");
}

void describe_value_list(printer& out) {
    describe_list(out);
    out.print(
        R"(        m.set = [](void* o, const std::string& t) { return static_cast<$C$*>(o)->append_$X$(value_of<$type$>(t)); };
        m.get = [](const void* o, unsigned i) { return to_text(static_cast<const $C$*>(o)->get_$X$(i)); };
        m.insert = [](void* o, unsigned i, const std::string& t) {
            return static_cast<$C$*>(o)->insert_$X$(i, value_of<$type$>(t));
        };
        m.set_at = [](void* o, unsigned i, const std::string& t) {
            return static_cast<$C$*>(o)->set_$X$(i, value_of<$type$>(t));
        };
)");
}

void describe_object(printer& out) {
    out.print(R"(        m.make = [](void* o) -> void* { return &static_cast<$C$*>(o)->get_$X$(); };
        m.look = [](const void* o, unsigned) -> const void* { return &static_cast<const $C$*>(o)->get_$X$(); };
        m.assign = [](void* o, unsigned, const void* v) -> void* {
            return &static_cast<$C$*>(o)->assign_$X$(*static_cast<const $class$*>(v));
        };
)");
}

void describe_object_list(printer& out) {
    describe_list(out);
    out.print(R"(        m.make = [](void* o) -> void* {
            static_cast<$C$*>(o)->append_$X$();
            return &static_cast<$C$*>(o)->back_$X$();
        };
        m.look = [](const void* o, unsigned i) -> const void* { return &static_cast<const $C$*>(o)->get_$X$(i); };
        m.reach = [](void* o, unsigned i) -> void* { return &static_cast<$C$*>(o)->get_$X$(i); };
        m.assign = [](void* o, unsigned i, const void* v) -> void* {
            return &static_cast<$C$*>(o)->assign_$X$(i, *static_cast<const $class$*>(v));
        };
)");
}

void describe_any_list(printer& out) {
    describe_list(out);
    out.print(
        R"(        m.set = [](void* o, const std::string& t) { return static_cast<$C$*>(o)->append_any(t); };
        m.get = [](const void* o, unsigned i) {
            std::string value;
            static_cast<const $C$*>(o)->get_any(i, nullptr, nullptr, &value);
            return value;
        };
        m.insert = [](void* o, unsigned i, const std::string& t) { return static_cast<$C$*>(o)->insert_any(i, t); };
)");
}

void describe_member(printer& out, const member_plan& member) {
    const printer_scope scope(
        out, {{"X", member.name}, {"type", member.value.type}, {"class", member.class_name}});
    out.print("    {\n        member m;\n");
    describe_flags(out, member);
    describe_facets(out, member.value.facet);
    switch (member.kind) {
        case member_kind::attribute:
        case member_kind::text:
        case member_kind::value:
        case member_kind::value_option:
            describe_simple(out, member);
            break;
        case member_kind::object:
        case member_kind::group:
        case member_kind::object_option:
            describe_object(out);
            break;
        case member_kind::value_list:
            describe_value_list(out);
            break;
        case member_kind::object_list:
        case member_kind::group_list:
            describe_object_list(out);
            break;
        case member_kind::any_list:
            describe_any_list(out);
            break;
    }
    if (member.has_presence_accessors()) describe_presence(out);
    out.print("        c.members.push_back(m);\n    }\n");
}

void describe_group(printer& out, const class_plan& made) {
    for (const group_member_plan& member : made.group) {
        out.print(R"(    c.group.push_back({"$M$", "$type$", $head$,
                       [](void* o) -> void* { return &static_cast<$C$*>(o)->get_$M$(); },
                       [](const void* o) -> const void* { return &static_cast<const $C$*>(o)->get_$M$(); }});
)",
                  {{"M", member.element},
                   {"type", member.class_name},
                   {"head", member.is_head ? "true" : "false"}});
    }
}

void describe_factory(printer& out, const class_plan& made) {
    std::vector<std::string> names;
    for (const std::string& name : made.factory) names.push_back(quoted(name));
    out.print(R"(    c.factory = {$names$};
    c.made_by_factory = [](int ns_id, const std::string& name, const char** id) -> const void* {
        static const $C$* made = nullptr;
        delete made;
        made = $C$::factory(ns_id, name);
        if (made != nullptr) *id = made->getid();
        return made;
    };
)",
              {{"names", join(names, ", ")}});
}

void describe_class(printer& out, const class_plan& made) {
    out.print("\nclass_description describe_$C$() {\n    class_description c;\n    c.name = \"$C$\";\n");
    out.print("    c.xml_name = \"$xml$\";\n    c.kind = class_form::$form$;\n",
              {{"xml", made.xml_name}, {"form", form_of(made.kind)}});
    const auto flag = [&out](const char* field, bool value) {
        if (value) out.print("    c.$field$ = true;\n", {{"field", field}});
    };
    flag("text_only", made.text_only);
    flag("nillable", made.nillable);
    flag("accepts_empty", made.accepts_empty);
    flag("polymorphic", made.polymorphic);
    flag("standalone", made.standalone);
    flag("declares_namespaces", made.declares_namespaces);
    if (!made.text_required) out.print("    c.text_required = false;\n");
    out.print("    describe_operations<$C$>(c);\n");
    if (made.kind != class_kind::group) out.print("    describe_reading<$C$>(c);\n");
    if (made.standalone) out.print("    describe_standalone<$C$>(c);\n");
    if (made.polymorphic) out.print("    describe_identity<$C$>(c);\n");
    if (!made.base.empty()) {
        out.print("    c.base = \"$base$\";\n    describe_base<$C$, $base$>(c);\n", {{"base", made.base}});
    }
    if (made.kind == class_kind::choice || made.kind == class_kind::group) {
        out.print(R"(    c.none_state = $C$::chosen_none;
    c.chosen = [](const void* o) -> int { return static_cast<const $C$*>(o)->getchosen(); };
)");
    }
    if (made.nillable) {
        out.print(R"(    c.is_nil = [](const void* o) { return static_cast<const $C$*>(o)->isnil_$C$(); };
    c.set_nil = [](void* o) { static_cast<$C$*>(o)->setnil_$C$(); };
)");
    }
    for (const member_plan& member : made.members) describe_member(out, member);
    if (made.kind == class_kind::group) describe_group(out, made);
    if (!made.factory.empty()) describe_factory(out, made);
    out.print("    return c;\n}\n");
}

}  // namespace

std::string emit_driver(const module_plan& module) {
    printer out;
    out.print(R"(// Generated from schema/$module$.xsd. To change it, change the schema.
#include "tests/driver/model_driver.h"

namespace vrl_driver {

using namespace vrl_v2;

namespace {
)",
              {{"module", module.name}});
    for (const class_plan* made : module.classes) {
        const printer_scope scope(out, {{"C", made->name}});
        describe_class(out, *made);
    }
    out.print("\n}  // namespace\n\nvoid describe_$module$(std::vector<class_description>& all) {\n",
              {{"module", module.name}});
    for (const class_plan* made : module.classes) {
        out.print("    all.push_back(describe_$C$());\n", {{"C", made->name}});
    }
    out.print("}\n\n}  // namespace vrl_driver\n");
    return out.text();
}

std::string emit_driver_list(const plan& model) {
    printer out;
    out.print(R"(// Generated from schema/. To change it, change the schema.
#include "tests/driver/model_driver.h"

namespace vrl_driver {

)");
    for (const module_plan& module : model.modules) {
        out.print("void describe_$it$(std::vector<class_description>& all);\n", {{"it", module.name}});
    }
    out.print(R"(
const std::vector<class_description>& classes() {
    static const std::vector<class_description> all = [] {
        std::vector<class_description> made;
)");
    for (const module_plan& module : model.modules) {
        out.print("        describe_$it$(made);\n", {{"it", module.name}});
    }
    out.print("        return made;\n    }();\n    return all;\n}\n\n}  // namespace vrl_driver\n");
    return out.text();
}

}  // namespace vrl_codegen
