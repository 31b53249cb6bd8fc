// The value that the library supplies for what was never written.
#pragma once

#include <cstdint>

#include "gateway/command.h"

namespace TOLVEX::ambrix {

/// "getVarPadValue" (identifier, variable): 1-by-1; 2-by-1 doubles for epoch16, a column of its
/// characters for text. Raises `unrecognizedValue` ("DATATYPE"), `libraryFailure`
/// ("CDFinquirezVar", "CDFgetzVarPadValue").
void getVarPadValue(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                    const CommandEntry*);

/// "setVarPadValue" (identifier, variable, value). Raises `unrecognizedValue` ("DATATYPE"),
/// `datatypeMismatch`, `wrongNumberOfPadValueElements`, `libraryFailure` ("CDFinquirezVar",
/// "CDFsetzVarPadValue").
void setVarPadValue(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*);

}  // namespace TOLVEX::ambrix
