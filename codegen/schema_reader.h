#pragma once

#include <string>

#include "codegen/schema_model.h"

namespace vrl_codegen {

/// Reads a schema document and all that it includes. Throws `schema_error`, with file and line, when it is no
/// valid XML Schema or uses anything that the compiler doesn't know.
schema read_schema(const std::string& path);

}  // namespace vrl_codegen
