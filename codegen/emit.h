#pragma once

#include <string>

#include "codegen/class_plan.h"
#include "codegen/printer.h"
#include "codegen/reference_plan.h"

/// The last stage: prints what the plan says, and decides nothing but the layout of text.
namespace vrl_codegen {

// emit_common.cpp
/// Lines of words behind a prefix, as long as lines may be; none for no text.
std::string filled(const std::string& text, const std::string& prefix);
/// Lines of a documentation comment.
std::string comment(const std::string& text, const std::string& indent);
/// A string literal, and a wide one.
std::string quoted(const std::string& text);
std::string wide_quoted(const std::string& text);
std::string join(const std::vector<std::string>& parts, const std::string& separator);
/// "{first, last}"
std::string braced(const row_range& names);
/// A row of a table of names.
void print_row(printer& out, const std::string& namespace_id, const std::string& name,
               const std::string& token);

// emit_forward.cpp: what all modules share.
std::string emit_forward(const plan& model);
std::string emit_tokens(const plan& model);
std::string emit_format(const plan& model);
std::string emit_chief_header(const plan& model);

// One header and one source for each module of the schema.
std::string emit_module_header(const module_plan& module);
std::string emit_module_source(const module_plan& module);

// emit_limits.cpp: the constants that hold facets.
void define_limits(printer& out, const limits_plan& limits);

// emit_reference.cpp: the reference pages of the format, in Markdown.
std::string emit_reference(const reference_plan& reference);

// emit_driver.cpp: the tests' own description of the model.
std::string emit_driver(const module_plan& module);
std::string emit_driver_list(const plan& model);

// emit_flat.cpp: the C functions, their header, the names in messages, the list of exports.
std::string emit_flat_header(const plan& model);
std::string emit_flat_names(const plan& model);
std::string emit_flat_source(const module_plan& module);
std::string emit_flat_values_source();
std::string emit_flat_exports(const plan& model);
// emit_flat_driver.cpp: the tests' tables of the C functions.
std::string emit_flat_driver(const module_plan& module);
std::string emit_flat_driver_list(const plan& model);

}  // namespace vrl_codegen
