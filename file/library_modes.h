// The two modes of the library as a whole: validation of files when they are opened, and the
// creation of files that CDF 2.7 can read. They hold for every file until changed or until the
// process ends.
#pragma once

#include <cstdint>

#include "gateway/command.h"

namespace TOLVEX::ambrix {

/// "getValidate" (): "VALIDATEFILEon" or "VALIDATEFILEoff" (`CDFgetValidate`).
void getValidate(int, qvArray* outputs[], std::int32_t, const qvArray*[], const CommandEntry*);

/// "setValidate" (-1 or 0) (`CDFsetValidate`). Raises `unrecognizedValue`.
void setValidate(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*);

/// "getFileBackward" (): "BACKWARDFILEon" or "BACKWARDFILEoff" (`CDFgetFileBackward`).
void getFileBackward(int, qvArray* outputs[], std::int32_t, const qvArray*[], const CommandEntry*);

/// "setFileBackward" (0 or 1) (`CDFsetFileBackward`). Raises `unrecognizedValue`.
void setFileBackward(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*);

}  // namespace TOLVEX::ambrix
