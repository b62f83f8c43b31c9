#pragma once

#include <ostream>

namespace bench {

/// Prints what the figures depend on: processor, memory, system, compiler, versions of the peers.
void print_machine(std::ostream& os);

}  // namespace bench
