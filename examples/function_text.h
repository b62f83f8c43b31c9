#pragma once

#include <V2/Vrl.h>

#include <string>

namespace examples {

/// A function of color difference in one line: its name, and its result where it has one.
std::string function_text(const vrl_v2::sg_Function& held);

}  // namespace examples
