#include "bench/race.h"

#include <malloc.h>
#include <time.h>

#include <algorithm>
#include <limits>

namespace bench {
namespace {

constexpr double k_megabyte = 1e6;

/// A contender on the track.
struct runner {
    std::string name;
    std::unique_ptr<contender> task;
    double best = std::numeric_limits<double>::infinity();  // seconds a byte
};

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

double processor_seconds() {
    timespec now{};
    ::clock_gettime(CLOCK_THREAD_CPUTIME_ID, &now);
    return static_cast<double>(now.tv_sec) + static_cast<double>(now.tv_nsec) * 1e-9;
}

std::vector<standing> race(const std::vector<entry>& entries, const document& input, int rounds) {
    std::vector<runner> runners;
    for (const entry& one : entries) runners.push_back({one.name, one.make()});
    for (runner& one : runners) one.task->prepare(input);
    for (int round = 0; round < rounds; ++round) {
        for (runner& one : runners) one.best = std::min(one.best, pace(*one.task, input, 1));
    }
    std::vector<standing> result;
    result.reserve(runners.size());
    for (const runner& one : runners) result.push_back({one.name, 1.0 / one.best / k_megabyte});
    return result;
}

double pace(const entry& task, const document& input, std::size_t bytes, int rounds) {
    keep_no_memory();
    runner one{task.name, task.make()};
    one.task->prepare(input);
    for (int round = 0; round < rounds; ++round) one.best = std::min(one.best, pace(*one.task, input, bytes));
    return one.best;
}

}  // namespace bench
