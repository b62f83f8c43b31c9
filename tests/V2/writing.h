#pragma once

#include <sstream>
#include <string>

#include "V2/Vrl.h"
#include "V2/format.h"

/// Writing one element, and what came of it.
namespace vrl_test {

struct written {
    int code;
    std::string text;
};

/// Writes `object` as an element of that name, as the first element of a writer without declaration.
template <class T>
written write_element(const T& object, const char* name) {
    std::ostringstream os;
    qbxV2::c_xml_writer out(os, "\t", "\n");
    const qbxV2::eqbx_error code = object.marshal(out, name);
    return {code, os.str()};
}

/// The same as if an outer element had been written before: without declarations of namespaces.
template <class T>
written write_inner_element(const T& object, const char* name) {
    std::ostringstream os;
    qbxV2::c_xml_writer out(os, "\t", "\n");
    out.conditionally_select_ns_map(vrl_v2::document_namespaces());
    out.conditionally_write_ns_attrs(true);
    os.str("");
    const qbxV2::eqbx_error code = object.marshal(out, name);
    return {code, os.str()};
}

}  // namespace vrl_test
