#pragma once

#include <V2/Vrl.h>

#include <string>

namespace examples {

/// A color value in one line: the name of its space, and its numbers or what else it says.
std::string color_space_text(const vrl_v2::sg_ColorSpace& space);

/// A number with at most five significant digits.
std::string number_text(double value);

/// The text of the model as the UTF-8 that terminals take.
std::string narrow(const std::wstring& text);

}  // namespace examples
