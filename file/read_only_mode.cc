#include "file/read_only_mode.h"

#include <cdf.h>

#include "file/file_settings.h"

namespace TOLVEX::ambrix {

void setReadOnlyMode(int outputCount, qvArray* outputs[], std::int32_t argumentCount,
                     const qvArray* arguments[], const CommandEntry* entry) {
  setFileNumber<kSetReadOnlyMode>(outputCount, outputs, argumentCount, arguments, entry);
  const CdfId file = getCdfIdArg(arguments[0]);
  const bool isOn = getLongScalarArg(arguments[1], kSetReadOnlyMode.label) == READONLYon;
  // The library keeps all attributes in memory now, but takes the one selected last from the file.
  // When a record that does not exist is read, it looks for a fill value, stumbles over that, and
  // frees its memory twice. So one is selected anew; a file without attributes has no such fault.
  if (isOn) CDFlib(SELECT_, CDF_, libraryHandle(file, kSetReadOnlyMode.routine), ATTR_, 0L, NULL_);
}

}  // namespace TOLVEX::ambrix
