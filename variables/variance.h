// Variances: the library's VARY (-1) and NOVARY (0), a logical or a double on the host's side.
#pragma once

#include <vector>

#include "host/qv.h"

namespace TOLVEX::ambrix {

/// Converts a variance argument, element by element. Raises `badVarianceDatatype` unless it is
/// logical or double, and `unrecognizedValue` (value, "VARIANCE") for a double that is neither -1
/// nor 0 after truncation.
std::vector<long> getVarianceArg(const qvArray* argument);

/// Raises `unrecognizedValue` (value, "VARIANCE") unless the value is VARY or NOVARY.
void validateVariance(long variance);

/// True for VARY, false for NOVARY. Raises like `validateVariance`.
bool varies(long variance);

}  // namespace TOLVEX::ambrix
