#include "codegen/emit_class.h"

namespace vrl_codegen {
namespace {

void define_attribute_reading(printer& out, const class_plan& made) {
    if (!made.has_own_attribute_reading()) return;
    const std::vector<const member_plan*> attributes = made.attributes();
    if (attributes.empty() && !made.nillable) {
        out.print(R"(
bool $C$::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) { return false; }
)");
        return;
    }
    const printer_scope scope(
        out, {{"inherited",
               made.base.empty() ? "false" : made.base + "::unmarshal_attributes(reader, name, error)"}});
    out.print(R"(
bool $C$::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_$C$_attributes);
)");
    if (made.nillable) out.print("    if (in.is_nil()) return in.read_nil(m_nil);\n");
    if (attributes.empty()) {
        out.print("    return $inherited$;\n}\n");
        return;
    }
    out.print("    switch (in.which()) {\n");
    int row = 0;
    for (const member_plan* member : attributes) {
        out.print(R"(        case $row$:
            return in.read(m_$X$, $limits$);
)",
                  {{"row", std::to_string(row++)}, {"X", member->name}, {"limits", member->value.limits}});
    }
    out.print("        default:\n            return $inherited$;\n    }\n}\n");
}

void define_attribute_check(printer& out, const class_plan& made) {
    if (!made.has_own_attributes()) return;
    const std::vector<const member_plan*> required = made.required_attributes();
    if (required.empty()) {
        out.print(made.base.empty() ? R"(
qbxV2::eqbx_error $C$::unmarshal_attributes_check(qbxV2::c_xml_reader&) { return qbxV2::EQBX_NO_ERROR; }
)"
                                    : R"(
qbxV2::eqbx_error $C$::unmarshal_attributes_check(qbxV2::c_xml_reader& reader) {
    return $base$::unmarshal_attributes_check(reader);
}
)");
        return;
    }
    out.print("\nqbxV2::eqbx_error $C$::unmarshal_attributes_check(qbxV2::c_xml_reader& reader) {\n");
    if (made.base_requires_attributes) {
        out.print(R"(    const qbxV2::eqbx_error missing = $base$::unmarshal_attributes_check(reader);
    if (missing != qbxV2::EQBX_NO_ERROR) return missing;
)");
    }
    out.print("    frame::required_attributes check(reader, k_source);\n");
    for (const member_plan* member : required) {
        out.print("    check.need(m_$X$, \"$X$\");\n", {{"X", member->name}});
    }
    out.print("    return check.result();\n}\n");
}

std::string reading_call(const member_plan& member) {
    const bool demanded = member.demanded_on_reading();
    switch (member.kind) {
        case member_kind::value:
            return demanded ? "required($row$, m_$X$, $limits$)" : "optional($row$, m_$X$, $limits$)";
        case member_kind::object:
            return demanded ? "required($row$, m_$X$)" : "optional($row$, m_$X$)";
        case member_kind::value_list:
            return demanded ? "at_least_one_value($row$, m_$X$, $limits$)"
                            : "repeated_values($row$, m_$X$, $limits$)";
        case member_kind::object_list:
            return demanded ? "at_least_one($row$, m_$X$)" : "repeated($row$, m_$X$)";
        case member_kind::group:
            return "group($row$, m_$X$)";
        case member_kind::group_list:
            return "groups($row$, m_$X$)";
        default:
            return {};
    }
}

/// The lists that need an entry, tested once more behind the content.
std::string filled_lists(const class_plan& made) {
    std::vector<std::string> tests;
    for (const member_plan* member : made.children()) {
        if (member->is_list() && member->required) tests.push_back("!m_" + member->name + ".empty()");
    }
    return join(tests, " && ");
}

void define_text_body(printer& out, const class_plan& made) {
    const member_plan& text = *made.text();
    out.print(R"(
bool $C$::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error, bool has_content) {
    frame::text_reader in(reader, *name, error, k_source);
    return in.read(m_$X$, $limits$, has_content);
}
)",
              {{"X", text.name}, {"limits", text.value.limits}});
}

void define_choice_body(printer& out, const class_plan& made) {
    out.print(R"(
bool $C$::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::children_reader in(reader, name, error, k_source, k_$C$_children, k_$C$_next);
    in.begin($first$);
    switch (in.which()) {
)",
              {{"first", braced(made.first_names)}});
    int row = 0;
    for (const member_plan* member : made.children()) {
        const bool value = member->kind == member_kind::value_option;
        const printer_scope scope(
            out, {{"row", std::to_string(row++)}, {"X", member->name}, {"limits", member->value.limits}});
        out.print("        case $row$:\n            choose(chosen_$X$);\n");
        out.print(value ? "            in.option_value(m_$X$.get(), $limits$);\n"
                        : "            in.option_object(m_$X$.get());\n");
        out.print("            break;\n");
    }
    out.print(R"(        default:
            in.no_option();
            break;
    }
    return in.done();
}
)");
}

void define_any_body(printer& out) {
    out.print(R"(
bool $C$::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
    frame::any_reader in(reader, name, error, k_source);
    in.read(m_any);
    return in.done();
}
)");
}

void define_children_body(printer& out, const class_plan& made) {
    const printer_scope scope(out, {{"first", braced(made.first_names)}});
    out.print(R"(
bool $C$::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
)");
    if (!made.base.empty())
        out.print("    if (!$base$::unmarshal_body(reader, name, error)) return false;\n");
    out.print("    frame::children_reader in(reader, name, error, k_source, k_$C$_children, k_$C$_next);\n");
    out.print(made.base.empty() ? "    in.begin($first$);\n" : "    in.begin_derived($first$);\n");
    int row = 0;
    for (const member_plan* member : made.children()) {
        out.print("    in." + reading_call(*member) + ";\n",
                  {{"row", std::to_string(row++)}, {"X", member->name}, {"limits", member->value.limits}});
    }
    const std::string filled = filled_lists(made);
    if (!filled.empty()) {
        out.print("    in.lists_filled($filled$, \"Vrl:$xml$\");\n",
                  {{"filled", filled}, {"xml", made.xml_name}});
    }
    out.print("    return in.done();\n}\n");
}

void define_body(printer& out, const class_plan& made) {
    switch (made.content) {
        case content_kind::text:
            define_text_body(out, made);
            break;
        case content_kind::children:
            define_children_body(out, made);
            break;
        case content_kind::choice:
            define_choice_body(out, made);
            break;
        case content_kind::any:
            define_any_body(out);
            break;
        case content_kind::none:
            out.print(R"(
bool $C$::unmarshal_body(qbxV2::c_xml_reader&, std::string*, qbxV2::eqbx_error*) { return true; }
)");
            break;
    }
}

}  // namespace

void define_reading(printer& out, const class_plan& made) {
    define_attribute_reading(out, made);
    define_attribute_check(out, made);
    if (made.has_own_content()) define_body(out, made);
}

}  // namespace vrl_codegen
