#pragma once

#include "codegen/emit.h"

/// The parts of a class. The holes "C" and "base" are filled by the caller.
namespace vrl_codegen {

// emit_copying.cpp: construction, assignment, swapping, cardinality.
void define_copying(printer& out, const class_plan& made);

// emit_identity.cpp: what the classes of a polymorphic family have beyond others.
void define_identity(printer& out, const class_plan& made);
void define_factory(printer& out, const class_plan& made);

// emit_standalone.cpp: the overloads that read and write whole documents.
void declare_standalone(printer& out, const class_plan& made);
void define_standalone(printer& out, const class_plan& made);

// emit_members.cpp: accessors and storage, by kind of member.
void declare_accessors(printer& out, const member_plan& member);
void declare_storage(printer& out, const member_plan& member);
void define_accessors(printer& out, const member_plan& member);

// emit_tables.cpp: names, and which of them may follow at each position.
void define_tables(printer& out, const class_plan& made);

// emit_reading.cpp, emit_writing.cpp: the steps that the frame calls.
void define_reading(printer& out, const class_plan& made);
void define_writing(printer& out, const class_plan& made);

// emit_choice.cpp, emit_group.cpp: classes of a form of their own.
/// The enumeration of what a choice or a group can hold.
void declare_states(printer& out, const std::vector<std::string>& names, int none_state);
void declare_choice(printer& out, const class_plan& made);
void define_choice(printer& out, const class_plan& made);
void declare_group(printer& out, const class_plan& made);
void define_group(printer& out, const class_plan& made);

}  // namespace vrl_codegen
