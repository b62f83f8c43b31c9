#pragma once

#include <cstddef>

namespace qbxV2 {

/// A row of a table that gives names their tokens. A row with a null name ends a table.
// The order of the fields is part of the interface. NOLINTNEXTLINE(clang-analyzer-optin.performance.Padding)
struct s_event_map {
    int ns_id;
    const char* name;
    std::size_t name_length;
    int token;
};

/// A row of a table of names that are not to be skipped. A row with a null name ends a table.
struct s_known_elements {
    int ns_id;
    const char* name;
    std::size_t name_length;
};

/// What `tokenise` matches: an attribute without a prefix has no namespace, an element takes the default one.
enum eqxp_attr_elem : int { EQXP_ATTRIBUTE = 0, EQXP_ELEMENT = 1 };

}  // namespace qbxV2
