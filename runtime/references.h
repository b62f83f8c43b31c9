#pragma once

#include <string>

#include "runtime/entities.h"

namespace qbxV2::detail {

/// Reads the name of a reference whose first value is `first`. True when a ";" closed it; what else stands
/// behind the name is pushed back. Source: XML 1.0, productions 68 and 69, but with an optional ";".
bool read_reference_name(c_entity_name_reader& reader, int first, std::string* name);

/// The character of a predefined entity, or NUL. Source: XML 1.0, 4.6 Predefined Entities.
char predefined_entity(const std::string& name);

}  // namespace qbxV2::detail
