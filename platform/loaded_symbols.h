#pragma once

namespace vrl_platform {

/// Whether some module of this process offers a function of this name to everybody.
bool process_offers(const char* function);

}  // namespace vrl_platform
