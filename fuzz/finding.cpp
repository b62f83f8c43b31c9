#include "fuzz/finding.h"

#include <algorithm>
#include <cstdio>
#include <cstdlib>

namespace fuzz {
namespace {

/// From the last line end that both texts share, and not too much of it.
std::string tail(const std::string& text, std::size_t from) {
    constexpr std::size_t k_shown = 2000;
    return text.substr(std::min(from, text.size()), k_shown);
}

}  // namespace

void report_finding(const std::string& what) {
    std::fprintf(stderr, "finding: %s\n", what.c_str());
    std::abort();
}

void require_equal(const char* what, const std::string& actual, const std::string& expected) {
    if (actual == expected) return;
    const auto differ = std::mismatch(actual.begin(), actual.end(), expected.begin(), expected.end());
    const auto at = static_cast<std::size_t>(differ.first - actual.begin());
    const std::size_t line_end = at == 0 ? std::string::npos : actual.rfind('\n', at - 1);
    const std::size_t from = line_end == std::string::npos ? 0 : line_end + 1;
    report_finding(std::string(what) + "\n--- this:\n" + tail(actual, from) + "\n--- that:\n" +
                   tail(expected, from));
}

}  // namespace fuzz
