#include <algorithm>
#include <map>

#include "codegen/emit.h"
#include "codegen/flat_functions.h"

/// The flat layer: a C function for each member function of the model, each of one line.
namespace vrl_codegen {
namespace {

constexpr const char k_generated[] =
    "/* Generated from schema/. To change it, change the schema or flat/. */\n";

void declare_functions(printer& out, const std::string& subject,
                       const std::vector<flat_function>& functions) {
    out.print("\n/* $subject$ */\n", {{"subject", subject}});
    for (const flat_function& f : functions) {
        out.print("VRL_FLAT_API $result$ $name$($parameters$);\n",
                  {{"result", f.result}, {"name", f.name}, {"parameters", f.parameters}});
    }
}

void define_functions(printer& out, const std::string& subject, const std::vector<flat_function>& functions) {
    out.print("\n// $subject$\n", {{"subject", subject}});
    for (const flat_function& f : functions) {
        out.print("$result$ $name$($parameters$) { return $body$; }\n",
                  {{"result", f.result},
                   {"name", f.name},
                   {"parameters", f.parameters == "void" ? "" : f.parameters},
                   {"body", f.body}});
    }
}

void define_source(printer& out, const std::string& origin) {
    out.print(R"(// Generated from $origin$. To change it, change that or flat/.
#include "flat/vrl_flat.h"

#include "flat/convention.h"
#include "flat/values.h"

using namespace vrl_flat;

extern "C" {
)",
              {{"origin", origin}});
}

}  // namespace

std::string emit_flat_header(const plan& model) {
    printer out;
    out.print(k_generated);
    out.print(R"(#ifndef VRL_FLAT_H
#define VRL_FLAT_H

/* Chief header of the flat layer: a prototype for every export. vrl_flat_base.h tells the convention. */

#include "flat/vrl_flat_base.h"

/* The names are what callers bind to, their double underscores included. */
/* NOLINTBEGIN(bugprone-reserved-identifier) */
#ifdef __cplusplus
extern "C" {
#endif
)");
    for (const flat_group& group : flat_functions_of_values())
        declare_functions(out, group.subject, group.functions);
    for (const class_plan& made : model.classes) declare_functions(out, made.name, flat_functions_of(made));
    out.print("\n#ifdef __cplusplus\n}\n#endif\n/* NOLINTEND(bugprone-reserved-identifier) */\n\n#endif\n");
    return out.text();
}

std::string emit_flat_names(const plan& model) {
    printer out;
    out.print(R"(// Generated from schema/. To change it, change the schema.
#pragma once

#include "V2/Vrl.h"

/// What the messages about nulls call each class.
namespace vrl_flat {

template <class T>
struct class_name;
/// A class where it crosses as an argument: two value types go by their other names there.
template <class T>
struct reference_name : class_name<T> {};

)");
    for (const class_plan& made : model.classes) {
        out.print(R"(template <>
struct class_name<vrl_v2::$C$> {
    static constexpr char text[] = "vrl_v2::$C$";
};
)",
                  {{"C", made.name}});
    }
    out.print("\n}  // namespace vrl_flat\n");
    return out.text();
}

std::string emit_flat_source(const module_plan& module) {
    printer out;
    define_source(out, "schema/" + module.name + ".xsd");
    out.print("\nusing namespace vrl_v2;\n");
    for (const class_plan* made : module.classes) define_functions(out, made->name, flat_functions_of(*made));
    out.print("\n}  // extern \"C\"\n");
    return out.text();
}

std::string emit_flat_values_source() {
    printer out;
    define_source(out, "codegen/flat_values.cpp");
    for (const flat_group& group : flat_functions_of_values()) {
        define_functions(out, group.subject, group.functions);
    }
    out.print("\n}  // extern \"C\"\n");
    return out.text();
}

std::string emit_flat_exports(const plan& model) {
    std::map<std::string, int> families;
    std::vector<std::string> names;
    const auto list = [&](const std::vector<flat_function>& functions) {
        for (const flat_function& f : functions) {
            ++families[f.family];
            names.push_back(f.name);
        }
    };
    for (const flat_group& group : flat_functions_of_values()) list(group.functions);
    for (const class_plan& made : model.classes) list(flat_functions_of(made));
    std::sort(names.begin(), names.end());
    std::string list_of_all;
    for (const auto& [family, count] : families) {
        list_of_all.append("# ").append(std::to_string(count)).append(" ").append(family).append("\n");
    }
    list_of_all.append("# ").append(std::to_string(names.size())).append(" in all\n");
    for (const std::string& name : names) list_of_all.append(name).append("\n");
    return list_of_all;
}

}  // namespace vrl_codegen
