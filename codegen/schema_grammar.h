#pragma once

#include <string>

#include "codegen/xml_dom.h"

namespace vrl_codegen {

inline constexpr char k_xs_namespace[] = "http://www.w3.org/2001/XMLSchema";
inline constexpr char k_note_namespace[] = "urn:vrl:codegen";

/// Throws `schema_error` unless the schema at `path`, with all that it includes, is valid W3C XML Schema 1.0:
/// libxml2 is the judge. What passes has no dangling names, no cycles of derivation, no doubled declarations.
void check_is_schema(const std::string& path);

/// Throws `schema_error` unless a module keeps to the part of XML Schema that the compiler knows, with its
/// own annotations where they have a meaning. A construct that was passed over in silence would be a hole in
/// the model.
void check_is_known(const document& module);

}  // namespace vrl_codegen
