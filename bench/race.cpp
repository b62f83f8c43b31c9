#include "bench/race.h"

#include <malloc.h>
#include <time.h>

#include <algorithm>
#include <limits>
#include <utility>

namespace bench {
namespace {

constexpr double k_megabyte = 1e6;

/// Seconds a byte over as many repetitions as reach `bytes`.
double pace(contender& task, const document& input, std::size_t bytes) {
    double time = 0.0;
    std::size_t done = 0;
    do {
        time += seconds([&] { task.run(input); });
        done += task.finish(input);
    } while (done < bytes);
    return time / static_cast<double>(done);
}

/// Every run gets its memory from the system. Left to itself the allocator keeps blocks of less than 32 MB
/// for the next run: small documents would be spared the page faults that large ones pay each time.
void keep_no_memory() {
    ::mallopt(M_MMAP_THRESHOLD, 128 * 1024);
    ::mallopt(M_TRIM_THRESHOLD, 128 * 1024);
}

}  // namespace

double standing::rate() const { return 1.0 / *std::min_element(paces.begin(), paces.end()) / k_megabyte; }

double median(std::vector<double> figures) {
    const auto middle = figures.begin() + static_cast<std::ptrdiff_t>(figures.size() / 2);
    std::nth_element(figures.begin(), middle, figures.end());
    return *middle;
}

double relative_time(const standing& one, const std::vector<const standing*>& others) {
    std::vector<double> ratios;
    for (std::size_t round = 0; round < one.paces.size(); ++round) {
        double sum = 0.0;
        for (const standing* const other : others) sum += other->paces[round];
        ratios.push_back(one.paces[round] / sum);
    }
    return median(std::move(ratios));
}

double processor_seconds() {
    timespec now{};
    ::clock_gettime(CLOCK_THREAD_CPUTIME_ID, &now);
    return static_cast<double>(now.tv_sec) + static_cast<double>(now.tv_nsec) * 1e-9;
}

std::vector<standing> race(const std::vector<entry>& entries, const document& input, int rounds) {
    std::vector<std::unique_ptr<contender>> tasks;
    std::vector<standing> result;
    for (const entry& one : entries) {
        tasks.push_back(one.make());
        tasks.back()->prepare(input);
        result.push_back({one.name, {}});
    }
    for (int round = 0; round < rounds; ++round) {
        for (std::size_t i = 0; i < tasks.size(); ++i) result[i].paces.push_back(pace(*tasks[i], input, 1));
    }
    return result;
}

double pace(const entry& task, const document& input, std::size_t bytes, int rounds) {
    keep_no_memory();
    const std::unique_ptr<contender> one = task.make();
    one->prepare(input);
    double best = std::numeric_limits<double>::infinity();
    for (int round = 0; round < rounds; ++round) best = std::min(best, pace(*one, input, bytes));
    return best;
}

}  // namespace bench
