#pragma once

#include <string>

#include "codegen/schema_model.h"

namespace vrl_codegen {

/// Reads a schema document and all that it includes. Throws `schema_error` on anything that the compiler
/// doesn't know: a construct that is passed over in silence would be a hole in the model.
schema read_schema(const std::string& path);

}  // namespace vrl_codegen
