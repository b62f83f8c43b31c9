#pragma once

#include <V2/Vrl.h>

#include <iosfwd>

namespace examples {

/// Prints what a document holds: palettes, color sets and colors with their values, then quality control.
/// With `color` each color has a swatch, for terminals with 24-bit color.
void print_document(std::ostream& out, const vrl_v2::Vrl& document, bool color);

}  // namespace examples
