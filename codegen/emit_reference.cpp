#include <algorithm>
#include <utility>

#include "codegen/emit.h"
#include "codegen/reference_words.h"

namespace vrl_codegen {
namespace {

constexpr const char k_introduction[] = R"(# The format of color documents

<!-- Generated from schema/. To change it, change the schema and run
     vrl_codegen schema/vrl.xsd --reference docs/format.md -->

Every element, attribute and type of the format, as `schema/` declares them. Elements are in the namespace
`$namespace$`, attributes in none. The modules stand in the order in which they build on each other.

**Occurs** is how often an element stands in its owner: `1` once, `0..1` at most once, `1..n` at least once, `0..n` any
number of times. Children stand in the order of their table, unless it says "one of". A type named `A/B` is the type of
the element `B` in `A`. The class of a type is called as the type; where it isn't, that is said.

Literals of enumerations are numbered from 1 in memory, the members of a group and the options of a choice from 0.

)";

void print_paragraph(printer& out, const std::string& text) {
    if (!text.empty()) out.print("$lines$\n", {{"lines", filled(text, "")}});
}

void print_list(printer& out, const std::string& before, const std::vector<std::string>& items) {
    if (items.empty()) return;
    print_paragraph(out, std::string(before).append(" ").append(join(items, ", ")).append("."));
}

void print_elements(printer& out, const std::vector<reference_element>& elements) {
    if (elements.empty()) return;
    out.print(R"(### Elements of $module$

| Element | Type | Meaning | Remarks | Used in |
|---|---|---|---|---|
)");
    for (const reference_element& element : elements) {
        out.print("| `$name$` | $type$ | $meaning$ | $remarks$ | $used$ |\n",
                  {{"name", element.name},
                   {"type", element.type},
                   {"meaning", element.meaning},
                   {"remarks", join(element.remarks, ", ")},
                   {"used", join(element.used_in, ", ")}});
    }
    out.print("\n");
}

/// A column that no row fills is left out.
void print_rows(printer& out, const char* head, const std::vector<reference_row>& rows) {
    if (rows.empty()) return;
    using cell = std::string reference_row::*;
    std::vector<std::pair<const char*, cell>> columns;
    for (const auto& [title, column] : {std::pair<const char*, cell>("Number", &reference_row::number),
                                        {head, &reference_row::name},
                                        {"Type", &reference_row::type},
                                        {"Occurs", &reference_row::occurs},
                                        {"Values", &reference_row::values},
                                        {"Meaning", &reference_row::meaning}}) {
        const bool used = std::any_of(rows.begin(), rows.end(),
                                      [c = column](const reference_row& row) { return !(row.*c).empty(); });
        if (used) columns.emplace_back(title, column);
    }
    for (const auto& column : columns) out.print("| $title$ ", {{"title", column.first}});
    out.print("|\n");
    for (std::size_t i = 0; i < columns.size(); ++i) out.print("|---");
    out.print("|\n");
    for (const reference_row& row : rows) {
        for (const auto& column : columns) out.print("| $cell$ ", {{"cell", row.*column.second}});
        out.print("|\n");
    }
    out.print("\n");
}

void print_group(printer& out, const reference_group& group) {
    out.print(R"(### $title$

Wherever a type refers to `$head$`, one of these elements stands.

)",
              {{"title", group.title}, {"head", group.head}});
    print_rows(out, "Element", group.members);
    print_list(out, "Used in", group.used_in);
}

void print_text(printer& out, const reference_row& text) {
    std::vector<std::string> words{text.type};
    for (const std::string& more : {text.values, text.occurs}) {
        if (!more.empty()) words.push_back(more);
    }
    print_list(out, "Text:", {join(words, "; ")});
}

void print_type(printer& out, const reference_type& type) {
    out.print("### $title$\n\n", {{"title", type.title}});
    print_paragraph(out, type.meaning);
    if (!type.extends.empty()) {
        print_paragraph(
            out, std::string("Extends ").append(type.extends).append(": what stands there comes first."));
    }
    for (const std::string& remark : type.remarks) print_paragraph(out, remark);
    if (type.has_text) print_text(out, type.text);
    print_rows(out, "Attribute", type.attributes);
    print_rows(out, type.is_choice ? "One of" : "Child", type.children);
    print_list(out, "Extended by", type.extended_by);
    print_list(out, "Used in", type.used_in);
    if (type.class_name != type.title) print_list(out, "Class:", {code(type.class_name)});
}

void print_simple_type(printer& out, const reference_simple_type& type) {
    out.print("### $title$\n\n", {{"title", type.title}});
    print_paragraph(out, type.meaning);
    if (type.literals.empty()) {
        const bool any = type.values.empty();
        print_list(out,
                   "Values:", {any ? type.type : std::string(type.type).append(", ").append(type.values)});
        return;
    }
    int number = 1;
    for (const std::string& literal : type.literals) {
        out.print("$number$. `$literal$`\n", {{"number", std::to_string(number++)}, {"literal", literal}});
    }
    out.print("\n");
}

void print_module(printer& out, const reference_module& module) {
    const printer_scope scope(out, {{"module", module.name}});
    out.print("## $title$\n\n", {{"title", module.title}});
    print_paragraph(out, module.meaning);
    print_elements(out, module.elements);
    for (const reference_group& group : module.groups) print_group(out, group);
    for (const reference_type& type : module.types) print_type(out, type);
    for (const reference_simple_type& type : module.simple_types) print_simple_type(out, type);
}

}  // namespace

std::string emit_reference(const reference_plan& reference) {
    printer out;
    out.print(k_introduction, {{"namespace", reference.document_namespace}});
    out.print("| Module | Subject |\n|---|---|\n");
    for (const reference_module& module : reference.modules) {
        out.print("| $link$ | $meaning$ |\n",
                  {{"link", link_to(module.name, module.title)}, {"meaning", module.meaning}});
    }
    out.print("\n");
    for (const reference_module& module : reference.modules) print_module(out, module);
    std::string text = out.fragment();
    text.pop_back();  // the blank line behind the last section
    return text;
}

}  // namespace vrl_codegen
