#include "codegen/emit_class.h"

namespace vrl_codegen {
namespace {

void define_attribute_rows(printer& out, const class_plan& made) {
    if (made.attributes().empty() && !made.nillable) return;
    out.print("constexpr qbxV2::s_event_map k_$C$_attributes[] = {\n");
    for (const member_plan* member : made.attributes()) {
        print_row(out, "qbxV2::k_ns_none", member->name, member->token);
    }
    if (made.nillable) out.print("    {qbxV2::k_ns_xsi, \"nil\", 3, qbxV2::EQXP_XSI_NIL},\n");
    out.print("};\n");
}

void define_child_rows(printer& out, const class_plan& made) {
    if (made.content != content_kind::children && made.content != content_kind::choice) return;
    out.print("constexpr qbxV2::s_event_map k_$C$_children[] = {\n");
    std::vector<std::string> ranges;
    for (const member_plan* member : made.children()) {
        if (member->is_group()) {
            out.print("    {frame::k_group_row, \"$X$\", 0, 0},\n", {{"X", member->name}});
        } else {
            print_row(out, "k_document_namespace_id", member->name, member->token);
        }
        ranges.push_back(braced(member->next));
    }
    out.print("};\nconstexpr frame::names_between k_$C$_next[] = {$ranges$};\n",
              {{"ranges", join(ranges, ", ")}});
}

}  // namespace

void define_tables(printer& out, const class_plan& made) {
    define_attribute_rows(out, made);
    define_child_rows(out, made);
}

}  // namespace vrl_codegen
