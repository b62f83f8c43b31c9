// Measures the library beside the peers that a user would pick instead, in one run, and judges it.
//
//     vrl_bench <folder>                         everything; documents are made in <folder>
//     vrl_bench --run <task> <file> <times>      one task alone, for a profiler
//     vrl_bench --peak-memory <task> <file>      what a task adds to the memory of its process, in bytes
//     vrl_bench --pace <task> <file> <bytes>     seconds a byte takes, over so many bytes at least
//
// Ends with 0 if every target was met, with 1 if one was missed, with 2 if something went wrong.

#include <algorithm>
#include <cstdlib>
#include <exception>
#include <fstream>
#include <iostream>
#include <string>
#include <utility>
#include <vector>

#include "bench/child.h"
#include "bench/contender.h"
#include "bench/flat_calls.h"
#include "bench/machine.h"
#include "bench/packing.h"
#include "bench/race.h"
#include "bench/table.h"
#include "bench/unit_costs.h"

namespace bench {
namespace {

// So many that the medians hold when half of the time something else uses the machine.
constexpr int k_rounds = 31;
// With 100 MB each takes seconds.
constexpr int k_long_rounds = 15;
constexpr int k_growth_rounds = 7;
// One takes milliseconds.
constexpr int k_rounds_of_unpacking = 45;
constexpr double k_growth = 1.15;
constexpr std::size_t k_mb = 1000000;

constexpr char k_load_memory[] = "vrl, load from memory";
constexpr char k_load_file[] = "vrl, load from file";
constexpr char k_write[] = "vrl, write to string";

target speed_goal(const std::string& task) {
    if (task == k_load_memory || task == k_write) return at_least(1.0);
    if (task == k_load_file) return at_least(0.9);
    return {};
}

void measure_speed(const document& input, table& results) {
    const std::vector<standing> standings = race(contenders(), input, k_rounds);
    const standing& measure = standings.front();
    for (const standing& one : standings) {
        results.add_rate(input.name, one.name, one.rate(), relative_time(measure, {&one}),
                         speed_goal(one.name));
    }
}

/// Each in a process of its own: a process does not give back all that it once had.
void measure_memory(const document& input, table& results) {
    for (const char* const task : {k_load_memory, k_load_file, "pugixml, DOM",
                                   "libxml2, DOM and schema validation", "xsdcxx, parse with validation"}) {
        const double peak = std::stod(output_of({own_path(), "--peak-memory", task, input.path}));
        const bool ours = task == k_load_memory || task == k_load_file;
        results.add_figure(input.name, std::string("peak memory: ") + task,
                           peak / static_cast<double>(input.bytes.size()), "bytes/byte", 2,
                           ours ? at_most(1.6) : target{});
    }
}

/// Processes in turn, one for each document and round: what one document leaves behind in the allocator must
/// not help or hinder the other.
void measure_growth(const document& small, const document& large, const char* task, target goal,
                    table& results) {
    const std::string bytes = std::to_string(large.bytes.size());
    const auto pace_of = [&](const document& input) {
        return std::stod(output_of({own_path(), "--pace", task, input.path, bytes}));
    };
    std::vector<double> ratios;
    for (int round = 0; round < k_growth_rounds; ++round) {
        const double small_pace = pace_of(small);
        ratios.push_back(pace_of(large) / small_pace);
    }
    results.add_figure(large.name, std::string("time a byte against ") + small.name + ": " + task,
                       median(std::move(ratios)), "times", 2, goal);
}

void measure_extremes(const std::string& folder, table& results) {
    const target goal = at_most(k_growth);
    measure_growth(make_attributes(folder, "10^4 attributes", 10000),
                   make_attributes(folder, "10^5 attributes", 100000), k_load_memory, goal, results);
    measure_growth(make_siblings(folder, "10^4 siblings", 10000),
                   make_siblings(folder, "10^5 siblings", 100000), k_load_memory, goal, results);
    const document text = make_text(folder, "text of 6.4 MB", 64 * k_mb / 10);
    const document long_text = make_text(folder, "text of 64 MB", 64 * k_mb);
    measure_growth(text, long_text, k_load_memory, goal, results);
    measure_growth(text, long_text, "pugixml, DOM", {}, results);
}

void measure_library_loading(table& results) {
    const std::string what = "loading of libvrl.so";
    const target goal = at_most(5.0);
    if (std::ifstream(VRL_BENCH_LIBRARY).fail()) return results.add_missing("", what, "not built", goal);
    double best = 1e9;
    for (int i = 0; i < k_rounds; ++i) {
        best = std::min(best, std::stod(output_of({VRL_BENCH_LIBRARY_LOADING, VRL_BENCH_LIBRARY})));
    }
    results.add_figure("", what, best / 1000.0, "ms", 2, goal);
}

int measure_everything(const std::string& folder) {
    table results;
    const document spectral = make_spectral_palette(folder, "spectral 10 MB", 10 * k_mb);
    const document brief = make_short_palette(folder, "short records 10 MB", 10 * k_mb);
    measure_speed(spectral, results);
    measure_speed(brief, results);
    measure_packing(spectral, k_rounds, results);
    measure_unpacking(spectral, k_rounds_of_unpacking, results);
    {
        const document small = make_spectral_palette(folder, "spectral 1 MB", k_mb);
        const document large = make_spectral_palette(folder, "spectral 100 MB", 100 * k_mb);
        measure_memory(large, results);
        measure_growth(small, large, k_load_memory, at_most(k_growth), results);
        measure_growth(small, large, k_write, at_most(k_growth), results);
        measure_packing(large, k_long_rounds, results);
        measure_unpacking(large, k_long_rounds, results);
        measure_packing_memory(large, results);
    }
    measure_extremes(folder, results);
    measure_library_loading(results);
    measure_flat_calls(results);
    measure_unit_costs(spectral, brief, results);

    print_machine(std::cout);
    std::cout << '\n';
    results.print(std::cout);
    std::cout << "\nvrl_bench: " << results.missed() << " of the targets missed\n";
    return results.all_met() ? EXIT_SUCCESS : EXIT_FAILURE;
}

int run_alone(const std::string& task, const std::string& path, int times) {
    const document input = read_document(path, path);
    const auto one = find_contender(task).make();
    one->prepare(input);
    for (int i = 0; i < times; ++i) {
        one->run(input);
        one->finish(input);
    }
    return EXIT_SUCCESS;
}

int tell_peak_memory(const std::string& task, const std::string& path) {
    const document input = read_document(path, path);
    std::cout << peak_memory(*find_contender(task).make(), input) << '\n';
    return EXIT_SUCCESS;
}

int tell_pace(const std::string& task, const std::string& path, std::size_t bytes) {
    std::cout << pace(find_contender(task), read_document(path, path), bytes, k_growth_rounds) << '\n';
    return EXIT_SUCCESS;
}

int run(const std::vector<std::string>& arguments) {
    if (arguments.size() == 4 && arguments[0] == "--run") {
        return run_alone(arguments[1], arguments[2], std::stoi(arguments[3]));
    }
    if (arguments.size() == 3 && arguments[0] == "--peak-memory") {
        return tell_peak_memory(arguments[1], arguments[2]);
    }
    if (arguments.size() == 4 && arguments[0] == "--pace") {
        return tell_pace(arguments[1], arguments[2], std::stoul(arguments[3]));
    }
    if (arguments.size() == 1 && arguments[0].compare(0, 2, "--") != 0)
        return measure_everything(arguments[0]);
    std::cerr << "usage: vrl_bench <folder> | --run <task> <file> <times> | --peak-memory <task> <file> |"
                 " --pace <task> <file> <bytes>\n";
    return 2;
}

}  // namespace
}  // namespace bench

int main(int argc, char** argv) {
    try {
        return bench::run({argv + 1, argv + argc});
    } catch (const std::exception& failure) {
        std::cerr << "vrl_bench: " << failure.what() << '\n';
        return 2;
    }
}
