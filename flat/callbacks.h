#pragma once

namespace vrl_flat {

/// Calls the ArgumentNullException callback, once one is registered. It records; it does not unwind.
void report_argument_null(const char* message);
/// The same for a reference: the name of its type, then what is said of it. Out of the way of the calls that
/// have nothing to report.
void report_null(const char* type, const char* reference);

}  // namespace vrl_flat
