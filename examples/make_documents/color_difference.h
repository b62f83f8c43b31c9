#pragma once

#include "examples/colorimetry.h"

/// Color differences. Where a formula is not symmetric, the standard comes first.
namespace examples {

/// Delta E*ab of CIE 15:2004, section 8.2.1.
double delta_e_1976(const lab& standard, const lab& sample);
/// CIE 116-1995, with the weights 0.045 and 0.015.
double delta_e_1994(const lab& standard, const lab& sample, double kl, double kc, double kh);
/// CIE 142-2001, in the form of Sharma, Wu and Dalal (Color Research and Application 30, 2005).
double delta_e_2000(const lab& standard, const lab& sample, double kl, double kc, double kh);
/// CMC l:c, ISO 105-J03.
double delta_e_cmc(const lab& standard, const lab& sample, double l, double c);

}  // namespace examples
