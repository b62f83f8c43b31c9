#include <set>

#include "codegen/emit.h"

namespace vrl_codegen {
namespace {

constexpr const char k_generated[] = "// Generated from schema/. To change it, change the schema.\n";

}  // namespace

std::string emit_forward(const plan& model) {
    printer out;
    out.print(k_generated);
    out.print(R"(#pragma once

namespace vrl_v2 {

)");
    for (const class_plan& made : model.classes) out.print("class $name$;\n", {{"name", made.name}});
    out.print("\n}  // namespace vrl_v2\n");
    return out.text();
}

std::string emit_tokens(const plan& model) {
    printer out;
    out.print(k_generated);
    out.print(R"(#pragma once

/// One number for each name of the format in each of its roles: `a_` as an attribute, `e_` as an element.
namespace vrl_v2::token {

enum : int {
)");
    for (const token_plan& token : model.tokens) {
        out.print("    $name$ = $number$,\n",
                  {{"name", token.name}, {"number", std::to_string(token.number)}});
    }
    out.print("};\n\n}  // namespace vrl_v2::token\n");
    return out.text();
}

std::string emit_format(const plan& model) {
    printer out;
    out.print(k_generated);
    out.print(R"(#pragma once

#include "runtime/namespaces.h"

namespace vrl_v2 {

/// The namespace of color documents, and what the reader and the writer know it by.
inline constexpr char k_document_namespace_uri[] = "$uri$";
inline constexpr int k_document_namespace_id = qbxV2::k_ns_first_free;

inline constexpr qbxV2::s_ns_map k_document_namespaces[] = {
    {k_document_namespace_id, "Vrl", k_document_namespace_uri},
    {0, nullptr, nullptr},
};

/// The map that every document's reader and writer selects.
inline const qbxV2::s_ns_map* document_namespaces() { return k_document_namespaces; }

}  // namespace vrl_v2
)",
              {{"uri", model.document_namespace}});
    return out.text();
}

std::string emit_chief_header(const plan& model) {
    printer out;
    out.print(k_generated);
    out.print(R"(#pragma once

/// Chief header of the document model: every class of the format, and the entry points of `Vrl`.

)");
    std::set<std::string> headers{"document_result"};
    for (const module_plan& module : model.modules) headers.insert(module.name);
    for (const std::string& header : headers) {
        out.print("#include \"V2/$header$.h\"\n", {{"header", header}});
    }
    return out.text();
}

}  // namespace vrl_codegen
