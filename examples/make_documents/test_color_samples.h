#pragma once

#include <vector>

namespace examples {

/// A test color sample of CIE 13.3-1995 "Method of measuring and specifying colour rendering properties of
/// light sources": its appearance under daylight, its approximate Munsell notation, and table 1's spectral
/// radiance factor from 400 to 700 nm in steps of 10.
struct test_color_sample {
    const wchar_t* appearance;
    const wchar_t* munsell;
    std::vector<double> reflectance;
};

/// Samples 1 to 14, in order.
extern const std::vector<test_color_sample> k_test_color_samples;

}  // namespace examples
