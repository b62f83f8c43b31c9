#include "platform/loaded_symbols.h"

#include <dlfcn.h>

namespace vrl_platform {

bool process_offers(const char* function) { return dlsym(RTLD_DEFAULT, function) != nullptr; }

}  // namespace vrl_platform
