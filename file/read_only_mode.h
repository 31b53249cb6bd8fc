// Read-only mode, which a file is in until it is closed or the mode is set again.
#pragma once

#include <cstdint>

#include "gateway/command.h"

namespace TOLVEX::ambrix {

/// "setReadOnlyMode" (identifier, -1 or 0). Raises `libraryFailure` ("CDFsetReadOnlyMode").
void setReadOnlyMode(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*);

}  // namespace TOLVEX::ambrix
