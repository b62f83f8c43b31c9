#pragma once

#include <string>

namespace vrl_v2 {

/// What a code of the ZIP engine says, in words. Codes below 100 are errno values and not told here.
std::string archive_message(int code);

}  // namespace vrl_v2
