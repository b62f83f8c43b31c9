#pragma once

#include "bench/table.h"

namespace bench {

/// What calls of C functions cost against the C++ functions behind them and, for a text, one conversion and
/// one allocation.
void measure_flat_calls(table& results);

}  // namespace bench
