#pragma once

#include <string>

namespace vrl_flat {

/// Calls the ArgumentNullException callback, once one is registered. It records; it does not unwind.
void report_argument_null(const std::string& message);

}  // namespace vrl_flat
