// Generated from schema/. To change it, change the schema.
#pragma once

#include "runtime/namespaces.h"

namespace vrl_v2 {

/// The namespace of color documents, and what the reader and the writer know it by.
inline constexpr char k_document_namespace_uri[] = "urn:vrl:golden";
inline constexpr int k_document_namespace_id = qbxV2::k_ns_first_free;

inline constexpr qbxV2::s_ns_map k_document_namespaces[] = {
    {k_document_namespace_id, "Vrl", k_document_namespace_uri},
    {0, nullptr, nullptr},
};

/// The map that every document's reader and writer selects.
inline const qbxV2::s_ns_map* document_namespaces() { return k_document_namespaces; }

}  // namespace vrl_v2
