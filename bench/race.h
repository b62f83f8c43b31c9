#pragma once

#include <string>
#include <vector>

#include "bench/contender.h"

namespace bench {

/// Seconds of processor time that this thread has had. Not the time of the clock: on a machine that does
/// other things too, those would be counted in.
double processor_seconds();

/// Processor seconds that `task` takes, with what the system does for it, page faults above all.
template <class Task>
double seconds(Task&& task) {
    const double start = processor_seconds();
    task();
    return processor_seconds() - start;
}

/// How a contender did, round by round.
struct standing {
    std::string name;
    std::vector<double> paces;  // seconds a byte

    /// Megabytes (10^6 bytes) a second, by the best round.
    double rate() const;
};

/// The middle one of `figures`, which are an odd number.
double median(std::vector<double> figures);

/// The times of `one` over those of all `others` together: the median of what each round gives. What ran side
/// by side met the same machine; the best rounds of a short task and of a long one need not have.
double relative_time(const standing& one, const std::vector<const standing*>& others);

/// Several contenders on one document, `rounds` times in turn, so that what else the machine does meets all
/// of them alike.
std::vector<standing> race(const std::vector<entry>& entries, const document& input, int rounds);

/// Processor seconds a byte of `input` takes, by the best of `rounds`, each repeated up to `bytes` bytes, so
/// that small documents are timed over as much work as large ones. To be asked in a process of its own: from
/// here on every run gets its memory from the system and gives it back.
double pace(const entry& task, const document& input, std::size_t bytes, int rounds);

}  // namespace bench
