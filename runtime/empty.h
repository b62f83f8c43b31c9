#pragma once

#include "platform/api.h"

namespace qbxV2 {

/// The value of an element without content.
class VRL_API c_empty {};

}  // namespace qbxV2
