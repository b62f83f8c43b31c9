#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "bench/contender.h"

namespace bench {

/// The last line that a program writes, run by itself. Throws std::runtime_error unless it ends with 0.
std::string output_of(const std::vector<std::string>& command);

/// Where this program stands.
std::string own_path();

/// What the run of `task` adds to the memory of this process at its highest, in bytes; to be asked in a
/// process of its own. The figure is the kernel's for the whole process (VmHWM less the VmRSS before), so it
/// has in it what the allocator keeps and rounds up, which counting calls of malloc would not see; and it
/// belongs to this process alone, whereas ru_maxrss of getrusage also knows the parent's size before exec.
/// The bytes of the document and all that `prepare` makes are there before and do not count.
std::size_t peak_memory(contender& task, const document& input);

}  // namespace bench
