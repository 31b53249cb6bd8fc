// Conversion between calendar times and nanoseconds of terrestrial time since 2000, leap seconds
// included (`CDF_TIME_TT2000`). Elements are taken in storage order, in groups, whatever the shape.
#pragma once

#include <cstdint>

#include "gateway/command.h"

namespace TOLVEX::ambrix {

/// "computeTT2000" (9-by-n double: year, month, day, hour, minute, second, millisecond,
/// microsecond, nanosecond): 1-by-n int64. Raises `badEpochVector` (9), `argumentOutOfBounds`,
/// `illegalEpochValue`.
void computeTt2000(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                   const CommandEntry*);

/// "tt2000Breakdown" (n int64): 9-by-n components. Raises `datatypeMismatch` (class,
/// "CDF_TIME_TT2000").
void tt2000Breakdown(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*);

}  // namespace TOLVEX::ambrix
