#include "codegen/flat_functions.h"

#include "codegen/flat_collector.h"

namespace vrl_codegen {
namespace {

/// How a simple value crosses.
struct crossing_form {
    std::string result;
    std::string parameter;
    std::string argument;   ///< the expression that the native function gets
    std::string reference;  ///< the class that crosses as a handle, for structured values
};

crossing_form crossing_of(const value_plan& value) {
    switch (value.kind) {
        case value_kind::number:
            return {"double", "double value", "value", ""};
        case value_kind::text:
            return {"char16_t*", "const char16_t* value", "wide(value)", ""};
        case value_kind::boolean:
            return {"int32_t", "int32_t value", "value != 0", ""};
        case value_kind::integer:
            return {"int32_t", "int32_t value", "value", ""};
        case value_kind::unsigned_integer:
            return {"uint32_t", "uint32_t value", "value", ""};
        case value_kind::byte:
            return {"uint8_t", "uint8_t value", "value", ""};
        case value_kind::date_time:
        case value_kind::binary:
            return {"void*", "void* value", "v", value.type};
    }
    return {};
}

/// A call that stores a simple value: `set_X(value)`, `insert_X(i, value)`.
void add_storing(flat_collector& out, const member_plan& member, const std::string& family,
                 const std::string& index_parameter, const std::string& index) {
    const crossing_form form = crossing_of(member.value);
    const printer::values holes = {{"X", member.name}, {"R", form.reference}};
    const std::string expression = "o." + family + "_$X$(" + index + form.argument + ")";
    const std::string parameters = index_parameter + ", " + form.parameter;
    if (form.reference.empty()) {
        out.call(family, "$C$_" + family + "_$X$", "int32_t", parameters, expression, holes);
    } else {
        out.add(family, "$C$_" + family + "_$X$", "int32_t", "void* self" + parameters,
                "call_with<$C$, $R$ const>(self, value, [&]($C$& o, $R$ const& v) { return " + expression +
                    "; })",
                holes);
    }
}

void add_simple(flat_collector& out, const member_plan& member) {
    const printer::values holes = {{"X", member.name}};
    out.call("get", "$C$_get_$X$", crossing_of(member.value).result, "", "o.get_$X$()", holes);
    add_storing(out, member, "set", "", "");
    if (member.value.facet.enumeration.empty()) return;
    out.call("getenum", "$C$_getenum_$X$", "int32_t", "", "o.getenum_$X$()", holes);
    out.call("setenum", "$C$_setenum_$X$", "int32_t", ", int32_t value",
             "o.setenum_$X$(static_cast<$C$::Eenum_$X$>(value))", holes);
}

void add_list_ends(flat_collector& out, const member_plan& member) {
    const printer::values holes = {{"X", member.name}};
    out.call("size", "$C$_size_$X$", "uint32_t", "", "o.size_$X$()", holes);
    out.call("delete_entry", "$C$_delete_$X$", "void", ", uint32_t i", "o.delete_$X$(i)", holes);
    out.call("clear", "$C$_clear_$X$", "void", "", "o.clear_$X$()", holes);
}

void add_value_list(flat_collector& out, const member_plan& member) {
    const printer::values holes = {{"X", member.name}};
    out.call("get", "$C$_get_$X$", crossing_of(member.value).result, ", uint32_t i", "o.get_$X$(i)", holes);
    add_storing(out, member, "set", ", uint32_t i", "i, ");
    add_storing(out, member, "append", "", "");
    add_storing(out, member, "insert", ", uint32_t i", "i, ");
    add_list_ends(out, member);
}

void add_object(flat_collector& out, const std::string& name, const std::string& type, bool list) {
    const printer::values holes = {{"X", name}, {"T", type}};
    const std::string index = list ? ", uint32_t i" : "";
    out.call("get_object", "$C$_get_$X$__SWIG_0", "void*", index, list ? "o.get_$X$(i)" : "o.get_$X$()",
             holes);
    out.add(
        "assign", "$C$_assign_$X$", "void*", "void* self" + index + ", void* value",
        std::string("call_with<$C$, $T$ const>(self, value, [&]($C$& o, $T$ const& v) -> decltype(auto) { "
                    "return o.assign_$X$(") +
            (list ? "i, v" : "v") + "); })",
        holes);
}

void add_object_list(flat_collector& out, const member_plan& member) {
    const printer::values holes = {{"X", member.name}};
    add_object(out, member.name, member.class_name, true);
    out.call("back", "$C$_back_$X$", "void*", "", "o.back_$X$()", holes);
    out.call("append", "$C$_append_$X$", "int32_t", "", "o.append_$X$()", holes);
    out.call("insert", "$C$_insert_$X$", "int32_t", ", uint32_t i", "o.insert_$X$(i)", holes);
    add_list_ends(out, member);
}

void add_any_list(flat_collector& out, const member_plan& member) {
    out.add("append", "$C$_append_any", "int32_t", "void* self, const char* value",
            "call_with_text<$C$>(self, value, [&]($C$& o) { return o.append_any(value); })");
    out.add("insert", "$C$_insert_any", "int32_t", "void* self, uint32_t i, const char* value",
            "call_with_text<$C$>(self, value, [&]($C$& o) { return o.insert_any(i, value); })");
    // Intended: the three texts are temporaries, so what the call fills in doesn't reach the caller.
    out.add("get_any", "$C$_get_any", "void",
            "void* self, uint32_t i, const char* ns, const char* name, const char* value",
            "get_any<$C$>(self, i, ns, name, value)");
    add_list_ends(out, member);
}

void add_member(flat_collector& out, const member_plan& member) {
    switch (member.kind) {
        case member_kind::attribute:
        case member_kind::text:
        case member_kind::value:
        case member_kind::value_option:
            add_simple(out, member);
            break;
        case member_kind::object:
        case member_kind::group:
        case member_kind::object_option:
            add_object(out, member.name, member.class_name, false);
            break;
        case member_kind::value_list:
            add_value_list(out, member);
            break;
        case member_kind::object_list:
        case member_kind::group_list:
            add_object_list(out, member);
            break;
        case member_kind::any_list:
            add_any_list(out, member);
            break;
    }
    if (!member.has_presence_accessors()) return;
    const printer::values holes = {{"X", member.name}};
    out.call("isset", "$C$_isset_$X$", "int32_t", "", "o.isset_$X$()", holes);
    out.call("unset", "$C$_unset_$X$", "void", "", "o.unset_$X$()", holes);
}

void add_life(flat_collector& out, const class_plan& made) {
    out.add("new", "new_$C$__SWIG_0", "void*", "void", "make<$C$>()");
    out.add("new", "new_$C$__SWIG_1", "void*", "void* other", "copy<$C$>(other)");
    out.add("delete", "delete_$C$", "void", "void* self", "destroy<$C$>(self)");
    if (!made.base.empty()) out.add("Upcast", "$C$Upcast", "void*", "void* self", "upcast<$C$, $B$>(self)");
    if (!made.declares_members) return;
    out.add("swap", "$C$_swap", "void", "void* self, void* other",
            "call_with<$C$, $C$>(self, other, [&]($C$& o, $C$& v) { o.swap(v); })");
    out.call("reset", "$C$_reset", "void", "", "o.reset()");
    out.call("is_occurs_ok", "$C$_is_occurs_ok", "int32_t", "", "o.is_occurs_ok()");
}

void add_documents(flat_collector& out) {
    out.add("marshal", "$C$_marshal__SWIG_0", "int32_t", "void* self, const char* path",
            "call_with_text<$C$>(self, path, [&]($C$& o) { return o.marshal(path); })");
    out.add("unmarshal", "$C$_unmarshal__SWIG_0", "int32_t", "void* self, const char* path",
            "call_with_text<$C$>(self, path, [&]($C$& o) { return o.unmarshal(path); })");
    out.add("unmarshal", "$C$_unmarshal__SWIG_1", "int32_t", "void* self, const char* bytes, uint32_t length",
            "call_with_text<$C$>(self, bytes, [&]($C$& o) { return o.unmarshal(bytes, length); })");
}

void add_identity(flat_collector& out, const class_plan& made) {
    out.call("clone", "$C$_clone", "void*", "", "o.clone()");
    out.call("getid", "$C$_getid", "const char*", "", "o.getid()");
    out.add("has_id", "$C$_has_id", "int32_t", "void* self, const char* id",
            "call_with_text<$C$>(self, id, [&]($C$& o) { return o.has_id(id); })");
    out.add("id_get", "$C$_id_get", "const char*", "void", "$C$::id");
    out.add("id_set", "$C$_id_set", "void", "const char* id", "replace_identity($C$::id, id)");
    if (made.factory.empty()) return;
    out.add("factory", "$C$_factory", "void*", "int32_t ns_id, const char* type_name",
            "with_text(type_name, [&] { return $C$::factory(ns_id, type_name); })");
}

void add_entry_points(flat_collector& out) {
    out.call("document", "$C$_loadFile", "int32_t", ", const char16_t* path", "o.loadFile(wide(path))");
    out.call("document", "$C$_loadString", "int32_t", ", const char16_t* xml", "o.loadString(wide(xml))");
    out.call("document", "$C$_writeFile", "int32_t", ", const char16_t* path", "o.writeFile(wide(path))");
    out.call("document", "$C$_writeString", "void*", "", "new XMLDocumentResult(o.writeString())");
}

}  // namespace

std::vector<flat_function> flat_functions_of(const class_plan& made) {
    flat_collector out({{"C", made.name}, {"B", made.base}});
    add_life(out, made);
    if (made.kind == class_kind::choice || made.kind == class_kind::group) {
        out.call("getchosen", "$C$_getchosen", "int32_t", "", "o.getchosen()");
    }
    if (made.standalone) add_documents(out);
    if (made.polymorphic && made.kind == class_kind::type) add_identity(out, made);
    if (made.kind == class_kind::root) add_entry_points(out);
    for (const group_member_plan& member : made.group)
        add_object(out, member.element, member.class_name, false);
    for (const member_plan& member : made.members) add_member(out, member);
    if (made.nillable) {
        out.call("isnil", "$C$_isnil_$C$", "int32_t", "", "o.isnil_$C$()");
        out.call("setnil", "$C$_setnil_$C$", "void", "", "o.setnil_$C$()");
    }
    return out.take();
}

}  // namespace vrl_codegen
