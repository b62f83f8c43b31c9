#pragma once

#include <string>
#include <vector>

#include "tests/driver/model_driver.h"

namespace vrl_driver {

/// A text at an end of a member's facets, or just outside, and the code that it has to give.
struct facet_value {
    std::string text;
    int setter;  ///< the code of the setter; -1 where a C++ caller cannot even pass the value
    int reader;  ///< the code of the reader
};

std::vector<facet_value> facet_values(const member& m);

}  // namespace vrl_driver
