#pragma once

#include <string>

namespace fuzz {

/// Says what went wrong and aborts, which is how a fuzzer learns of it.
[[noreturn]] void report_finding(const std::string& what);

/// Aborts unless the two are equal; shows the lines from the first difference on.
void require_equal(const char* what, const std::string& actual, const std::string& expected);

}  // namespace fuzz
