#pragma once

#include <string>

#include "runtime/xml_reader.h"

namespace vrl_v2 {

/// What a report of the reader means, for people: what is wrong, what was expected or found, and within which
/// elements. To be asked while the report is made: the reader's present state is part of the answer.
std::string report_message(const qbxV2::c_xml_reader& reader, qbxV2::c_string_stack& open_elements,
                           const std::string& value, qbxV2::eqbx_error code, const std::string& item);

}  // namespace vrl_v2
