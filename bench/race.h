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

/// How fast a contender was at its best, in megabytes (10^6 bytes) a second.
struct standing {
    std::string name;
    double rate;
};

/// Several contenders on one document, `rounds` times in turn, so that what else the machine does meets all
/// of them alike.
std::vector<standing> race(const std::vector<entry>& entries, const document& input, int rounds);

/// Processor seconds a byte of `input` takes, by the best of `rounds`, each repeated up to `bytes` bytes, so
/// that small documents are timed over as much work as large ones. To be asked in a process of its own: from
/// here on every run gets its memory from the system and gives it back.
double pace(const entry& task, const document& input, std::size_t bytes, int rounds);

}  // namespace bench
