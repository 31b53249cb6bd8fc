// Conversion between calendar times and the library's epochs: milliseconds as one double,
// picoseconds as a pair of doubles. Elements are taken in storage order, in groups, whatever the
// shape.
#pragma once

#include <cstdint>

#include "gateway/command.h"

namespace TOLVEX::ambrix {

/// "computeEpoch" (7-by-n double: year, month, day, hour, minute, second, millisecond): 1-by-n
/// epochs
/// (`computeEPOCH`). Raises `badEpochVector` (7), `illegalEpochValue`.
void computeEpoch(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                  const CommandEntry*);

/// "computeEpoch16" (10-by-n double: as above, microsecond, nanosecond, picosecond): 2-by-n doubles
/// (`computeEPOCH16`). Raises `badEpochVector` (10), `illegalEpochValue`.
void computeEpoch16(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                    const CommandEntry*);

/// "epochBreakdown" (n epochs): 7-by-n components (`EPOCHbreakdown`). Raises
/// `argumentNotDoublePrecision` ("EPOCHTIME").
void epochBreakdown(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                    const CommandEntry*);

/// "epoch16Breakdown" (2-by-n or any even number of doubles): 10 components by the further
/// dimensions of the input, or by the number of pairs (`EPOCH16breakdown`). Raises
/// `badEpoch16Modulus`, `argumentNotDoublePrecision` ("EPOCH16TIME").
void epoch16Breakdown(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                      const CommandEntry*);

}  // namespace TOLVEX::ambrix
