#pragma once

#include <string>

#include "runtime/white_space.h"

/// What a scanner makes of a document, as text that can be compared.
///
///   <a b=[1]> 'text' <c/> </a> EOF      events; attribute values in brackets
///   ERROR  FAIL                         an error event; a value that could not be read
///   !1/23@2: text                       a report: severity, code, line, message
///
/// Reading ends at the first failure. Each document is read on every path, and the outcomes are compared.
namespace scan_trace {

/// All events of a document, with text as it is delivered.
std::string events(const std::string& document);

/// The value of the document's root element, which must have simple content: "'value' end", or what failed.
std::string value(const std::string& document, qbxV2::eqbx_whitespace mode = qbxV2::EQBX_WS_PRESERVE,
                  bool expand_entities = true);

/// The value of the first attribute of the root element: "[value]", or what failed.
std::string attribute(const std::string& document, qbxV2::eqbx_whitespace mode = qbxV2::EQBX_WS_PRESERVE);

}  // namespace scan_trace
