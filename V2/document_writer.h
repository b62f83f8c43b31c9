#pragma once

#include "V2/document_file.h"
#include "V2/document_output.h"

namespace vrl_v2 {

/// Writes a document's text under this library's name, and leaves the document alone: what is stamped is a
/// copy of its preamble. Hands everything on to `out`.
///
/// Failure   bad_document with the model's code, and with the place of what is missing; else the output's.
file_outcome write_document(const Vrl& document, document_output& out);

}  // namespace vrl_v2
