#pragma once

#include <vector>

#include "examples/make_documents/spectra.h"

namespace vrl_test {

/// The general color rendering index of a lamp by CIE 13.3-1995: how alike the first eight test colors look
/// under it and under a blackbody (below 5000 K) or daylight of its color temperature. 100 is alike.
double general_rendering_index(const examples::spectrum& lamp,
                               const std::vector<examples::spectrum>& test_colors);

}  // namespace vrl_test
