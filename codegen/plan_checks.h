#pragma once

#include "codegen/class_plan.h"
#include "codegen/schema_model.h"

namespace vrl_codegen {

/// Throws `schema_error` where the schema, valid as it is, asks for something that no class can be, or where
/// an annotation would mean nothing.
void check_declarations(const schema& source);

/// Throws `schema_error` where accessors, enumerators or initial values of a class would clash.
void check_classes(const plan& model);

}  // namespace vrl_codegen
