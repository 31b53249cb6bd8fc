// Values with a fixed set of legal ones.
#pragma once

#include <cstdint>

#include "host/qv.h"

namespace TOLVEX::ambrix {

/// "GLOBAL_SCOPE" for 1, "VARIABLE_SCOPE" for 2; raises `unrecognizedValue` (value, "SCOPE") else.
qvArray* scopeName(std::int64_t scope);

/// Returns for 0, 1, 2, 3 and 5; raises `unrecognizedValue` (value, "COMPRESSION") else.
void checkCompressionType(std::int64_t type);

}  // namespace TOLVEX::ambrix
