#include "codegen/emit.h"

namespace vrl_codegen {
namespace {

bool is_group(const member_plan& member) {
    return member.kind == member_kind::group || member.kind == member_kind::group_list;
}

std::string range_text(const row_range& names) {
    return std::string("{")
        .append(std::to_string(names.first))
        .append(", ")
        .append(std::to_string(names.last))
        .append("}");
}

void define_attribute_rows(printer& out, const class_plan& made) {
    if (made.attributes().empty() && !made.nillable) return;
    out.print("constexpr qbxV2::s_event_map k_$C$_attributes[] = {\n");
    for (const member_plan* member : made.attributes()) {
        out.print("    {qbxV2::k_ns_none, \"$X$\", $length$, token::$token$},\n",
                  {{"X", member->name}, {"length", number_of_units(member->name)}, {"token", member->token}});
    }
    if (made.nillable) out.print("    {qbxV2::k_ns_xsi, \"nil\", 3, qbxV2::EQXP_XSI_NIL},\n");
    out.print("};\n");
}

void define_child_rows(printer& out, const class_plan& made) {
    if (made.children().empty() || made.children().front()->kind == member_kind::any_list) return;
    out.print("constexpr qbxV2::s_event_map k_$C$_children[] = {\n");
    for (const member_plan* member : made.children()) {
        if (is_group(*member)) {
            out.print("    {frame::k_group_row, \"$X$\", 0, 0},\n", {{"X", member->name}});
        } else {
            out.print(
                "    {k_document_namespace_id, \"$X$\", $length$, token::$token$},\n",
                {{"X", member->name}, {"length", number_of_units(member->name)}, {"token", member->token}});
        }
    }
    out.print("};\nconstexpr frame::names_between k_$C$_next[] = {");
    std::vector<std::string> ranges;
    for (const member_plan* member : made.children()) ranges.push_back(range_text(member->next));
    out.print("$ranges$};\n", {{"ranges", join(ranges, ", ")}});
}

void define_attribute_reading(printer& out, const class_plan& made) {
    const bool own = !made.attributes().empty() || made.nillable;
    if (!own && !made.base.empty()) return;
    const std::string fallback =
        made.base.empty() ? "false" : made.base + "::unmarshal_attributes(reader, name, error)";
    if (!own) {
        out.print(R"(
bool $C$::unmarshal_attributes(qbxV2::c_xml_reader&, std::string const&, qbxV2::eqbx_error*) { return false; }
)");
        return;
    }
    out.print(R"(
bool $C$::unmarshal_attributes(qbxV2::c_xml_reader& reader, std::string const& name, qbxV2::eqbx_error* error) {
    frame::attribute_reader in(reader, name, error, k_source, k_$C$_attributes);
)");
    if (made.nillable) out.print("    if (in.is_nil()) return in.read_nil(m_nil);\n");
    if (!made.attributes().empty()) {
        out.print("    switch (in.which()) {\n");
        int row = 0;
        for (const member_plan* member : made.attributes()) {
            out.print(
                "        case $row$:\n            return in.read(m_$X$, $limits$);\n",
                {{"row", std::to_string(row++)}, {"X", member->name}, {"limits", member->value.limits}});
        }
        out.print("        default:\n            return $fallback$;\n    }\n}\n", {{"fallback", fallback}});
    } else {
        out.print("    return $fallback$;\n}\n", {{"fallback", fallback}});
    }
}

void define_attribute_check(printer& out, const class_plan& made) {
    const bool own = !made.attributes().empty();
    if (!own && !made.base.empty()) return;
    std::vector<const member_plan*> required;
    for (const member_plan* member : made.attributes()) {
        if (member->required) required.push_back(member);
    }
    if (required.empty()) {
        const std::string result =
            made.base.empty() ? "qbxV2::EQBX_NO_ERROR" : made.base + "::unmarshal_attributes_check(reader)";
        out.print(R"(
qbxV2::eqbx_error $C$::unmarshal_attributes_check(qbxV2::c_xml_reader&$reader$) { return $result$; }
)",
                  {{"reader", made.base.empty() ? "" : " reader"}, {"result", result}});
        return;
    }
    out.print(R"(
qbxV2::eqbx_error $C$::unmarshal_attributes_check(qbxV2::c_xml_reader& reader) {
    frame::required_attributes check(reader, k_source);
)");
    for (const member_plan* member : required) {
        out.print("    check.need(m_$X$, \"$X$\");\n", {{"X", member->name}});
    }
    out.print("    return check.result();\n}\n");
}

std::string reading_call(const member_plan& member, unsigned row) {
    const std::string at = std::to_string(row) + ", m_" + member.name;
    const std::string with_limits = at + ", " + member.value.limits;
    const bool demanded = member.required && !member.read_optional;
    switch (member.kind) {
        case member_kind::value:
            return demanded ? "required(" + with_limits + ")" : "optional(" + with_limits + ")";
        case member_kind::object:
            return demanded ? "required(" + at + ")" : "optional(" + at + ")";
        case member_kind::value_list:
            return demanded ? "at_least_one_value(" + with_limits + ")"
                            : "repeated_values(" + with_limits + ")";
        case member_kind::object_list:
            return demanded ? "at_least_one(" + at + ")" : "repeated(" + at + ")";
        case member_kind::group:
            return "group(" + at + ")";
        case member_kind::group_list:
            return "groups(" + at + ")";
        default:
            return "";
    }
}

/// The lists that need an entry, tested once more behind the content.
std::string filled_lists(const class_plan& made) {
    std::vector<std::string> tests;
    for (const member_plan* member : made.children()) {
        const bool list = member->kind == member_kind::value_list ||
                          member->kind == member_kind::object_list || member->kind == member_kind::group_list;
        if (list && member->required) tests.push_back("!m_" + member->name + ".empty()");
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
              {{"first", range_text(made.first_names)}});
    int row = 0;
    for (const member_plan* member : made.children()) {
        const std::string limits =
            member->kind == member_kind::value_option ? ", " + member->value.limits : std::string();
        out.print(R"(        case $row$:
            choose(chosen_$X$);
            in.option_$what$(m_$X$.get()$limits$);
            break;
)",
                  {{"row", std::to_string(row++)},
                   {"X", member->name},
                   {"what", member->kind == member_kind::value_option ? "value" : "object"},
                   {"limits", limits}});
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
    out.print(R"(
bool $C$::unmarshal_body(qbxV2::c_xml_reader& reader, std::string* name, qbxV2::eqbx_error* error) {
)");
    if (!made.base.empty()) {
        out.print("    if (!$base$::unmarshal_body(reader, name, error)) return false;\n",
                  {{"base", made.base}});
    }
    out.print("    frame::children_reader in(reader, name, error, k_source, k_$C$_children, k_$C$_next);\n");
    out.print("    in.$begin$($first$);\n", {{"begin", made.base.empty() ? "begin" : "begin_derived"},
                                             {"first", range_text(made.first_names)}});
    unsigned row = 0;
    for (const member_plan* member : made.children()) {
        out.print("    in.$call$;\n", {{"call", reading_call(*member, row++)}});
    }
    const std::string filled = filled_lists(made);
    if (!filled.empty()) {
        out.print("    in.lists_filled($filled$, \"Vrl:$xml$\");\n",
                  {{"filled", filled}, {"xml", made.xml_name}});
    }
    out.print("    return in.done();\n}\n");
}

}  // namespace

void define_tables(printer& out, const class_plan& made) {
    if (made.kind == class_kind::group || !made.declares_members) return;
    define_attribute_rows(out, made);
    define_child_rows(out, made);
}

void define_reading(printer& out, const class_plan& made) {
    define_attribute_reading(out, made);
    if (!made.nillable || made.base.empty()) define_attribute_check(out, made);
    const auto children = made.children();
    if (made.text() != nullptr) {
        define_text_body(out, made);
    } else if (made.kind == class_kind::choice) {
        define_choice_body(out, made);
    } else if (!children.empty() && children.front()->kind == member_kind::any_list) {
        define_any_body(out);
    } else if (!children.empty()) {
        define_children_body(out, made);
    }
}

}  // namespace vrl_codegen
