#pragma once

#include <string>

#include "codegen/class_plan.h"
#include "codegen/printer.h"

/// The last stage: prints what the plan says, and decides nothing but the layout of text.
namespace vrl_codegen {

// emit_common.cpp
std::string comment(const std::string& text, const std::string& indent);
std::string quoted(const std::string& text);
std::string number_of_units(const std::string& text);
/// What a getter returns: numbers by value, everything else by reference to what is stored.
std::string result_type(const value_plan& value);
std::string join(const std::vector<std::string>& parts, const std::string& separator);
/// "member_literal", as the enumerator of an enumerated text is called.
std::string enumerator(const std::string& member, const std::string& literal);

// emit_forward.cpp: what all modules share.
std::string emit_forward(const plan& model);
std::string emit_tokens(const plan& model);
std::string emit_format(const plan& model);
std::string emit_chief_header(const plan& model);

// One header and one source for each module of the schema.
std::string emit_module_header(const module_plan& module);
std::string emit_module_source(const plan& model, const module_plan& module);

// emit_driver.cpp: the tests' own description of the model.
std::string emit_driver(const module_plan& module);
std::string emit_driver_list(const plan& model);

// emit_members.cpp: accessors, by kind of member.
void declare_accessors(printer& out, const member_plan& member);
void declare_storage(printer& out, const member_plan& member);
void define_accessors(printer& out, const class_plan& owner, const member_plan& member);

// emit_reading.cpp and emit_writing.cpp: the steps that the frame calls.
void define_tables(printer& out, const class_plan& made);
void define_reading(printer& out, const class_plan& made);
void define_writing(printer& out, const class_plan& made);

// emit_choice.cpp, emit_group.cpp: classes of a form of their own.
void declare_choice_state(printer& out, const class_plan& made);
void define_choice(printer& out, const class_plan& made);
void declare_group(printer& out, const class_plan& made);
void define_group(printer& out, const class_plan& made);

}  // namespace vrl_codegen
