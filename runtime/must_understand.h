#pragma once

#include <string>

#include "platform/api.h"

namespace qbxV2 {

class c_xml_reader;

/// Whether a document demands that its reader understands something.
enum eqbx_must_understand : int {
    EQBX_MUST_UNDERSTAND_NO = 0,
    EQBX_MUST_UNDERSTAND_INVALID = 1,
    EQBX_MUST_UNDERSTAND_YES = 2
};

/// An XML Schema boolean: "1" and "true" are yes, "0" and "false" no, everything else is invalid.
VRL_API eqbx_must_understand bool_must_understand(const std::string& value);

/// Scans the document for attributes of this namespace and local name and lets `decide` judge each value; the
/// first answer but no ends the scan and is the result.
///
/// Invalid also for a document without a root element, for one that is not well-formed up to the answer, and
/// for one nested deeper than the reader's limit. The reader is back at the start then, unless there was no
/// root element; `set_ns_map` has to run again.
VRL_API eqbx_must_understand has_must_understand(c_xml_reader& reader, const std::string& ns,
                                                 const std::string& local_name,
                                                 eqbx_must_understand (*decide)(const std::string&));

/// The namespace URI of the document's root element, empty when it has none. False when there is no root
/// element, or its prefix is undeclared. The reader is back at the start; `set_ns_map` has to run again.
VRL_API bool get_instance_namespace(c_xml_reader& reader, std::string* ns);

}  // namespace qbxV2
