#pragma once

#include "V2/Vrl.h"

namespace vrl_v2 {

/// The name under which this library reads and writes.
SDKType this_library();

}  // namespace vrl_v2
