#pragma once

#include <V2/Vrl.h>

#include <string>

namespace examples {

/// Two character cells in the color's own color, for terminals with 24-bit color. Blank cells where the color
/// has no value that can be shown.
std::string swatch(const vrl_v2::ColorType& color);

}  // namespace examples
