#pragma once

namespace qbxV2 {

/// How character data is stored. Source: XML Schema Part 2, 4.3.6 whiteSpace.
enum eqbx_whitespace : int {
    EQBX_WS_PRESERVE = 0,  ///< as it stands
    EQBX_WS_REPLACE = 1,   ///< each white-space character becomes one space
    EQBX_WS_COLLAPSE = 2   ///< inner white space becomes one space; none at the ends
};

}  // namespace qbxV2
