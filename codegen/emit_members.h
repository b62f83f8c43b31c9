#pragma once

#include "codegen/emit_class.h"

/// The accessors of each kind of member. The holes "X", "in", "type", "limits", "class" and, for a
/// definition, "C" are filled by the caller.
namespace vrl_codegen {

// emit_members.cpp
void declare_presence(printer& out, const member_plan& member);

// emit_values.cpp: attributes, texts, single children and options of simple type.
void declare_value(printer& out, const member_plan& member);
void define_value(printer& out, const member_plan& member);
void define_value_option(printer& out, const member_plan& member);

// emit_objects.cpp: single children and options of class type, groups.
void declare_object(printer& out, const member_plan& member);
void define_object(printer& out, const member_plan& member);
void define_object_option(printer& out);

// emit_lists.cpp
void declare_value_list(printer& out);
void define_value_list(printer& out);
void declare_object_list(printer& out);
void define_object_list(printer& out);
void declare_any_list(printer& out);
void define_any_list(printer& out);

}  // namespace vrl_codegen
