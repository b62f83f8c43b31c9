#pragma once

#include "bench/document.h"
#include "bench/table.h"

namespace bench {

/// What single operations of values and of the model cost, in nanoseconds; on the first color of each
/// palette.
void measure_unit_costs(const document& spectral, const document& brief, table& results);

}  // namespace bench
