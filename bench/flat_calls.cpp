#include "bench/flat_calls.h"

#include <array>
#include <cstdio>
#include <sstream>
#include <stdexcept>
#include <string>

#include "bench/child.h"

namespace bench {
namespace {

constexpr double k_times_the_cpp_call = 2.0;

struct costs {
    double flat = 0.0;
    double twin = 0.0;
    double conversion = 0.0;
    double allocation = 0.0;
};

std::string described(const char* operation, const costs& of) {
    std::array<char, 200> text{};
    std::snprintf(text.data(), text.size(), "%s: %.1f ns; in C++ %.1f", operation, of.flat, of.twin);
    std::string all = text.data();
    if (of.allocation > 0.0) {
        std::snprintf(text.data(), text.size(), ", a conversion %.1f, an allocation %.1f", of.conversion,
                      of.allocation);
        all += text.data();
    }
    return all;
}

}  // namespace

void measure_flat_calls(table& results) {
    for (const char* const operation :
         {"get a number", "set a number", "get a text of 20 units", "set a text of 20 units"}) {
        std::istringstream line(output_of({VRL_BENCH_FLAT_CALL_COSTS, operation}));
        costs taken;
        line >> taken.flat >> taken.twin >> taken.conversion >> taken.allocation;
        if (line.fail()) throw std::runtime_error(operation);
        results.add_figure("calls from C", described(operation, taken),
                           taken.flat / (taken.twin + taken.conversion + taken.allocation), "times", 2,
                           at_most(k_times_the_cpp_call));
    }
}

}  // namespace bench
