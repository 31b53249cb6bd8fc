#include "file/read_only_mode.h"

#include <cdf.h>

#include "gateway/arguments.h"
#include "gateway/library_calls.h"
#include "gateway/library_faults.h"
#include "gateway/open_file_registry.h"

namespace TOLVEX::ambrix {

void setReadOnlyMode(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*) {
  const char* routine = "CDFsetReadOnlyMode";
  const CdfId file = getCdfIdArg(arguments[0]);
  // What is too large for the library must not become -1, which means on.
  const long mode = libraryNumber(getLongScalarArg(arguments[1], "MODE"), kNoSuchNumber);
  callOnFile(routine, file, CDF_READONLY_MODE_, mode);
  if (mode != READONLYon || !libraryFaults().freesSelectedAttributeTwice) return;
  // Guard: the library keeps all attributes in memory now, but takes the one selected last from the
  // file. When a record that does not exist is read, it looks for a fill value, stumbles over that,
  // and frees its memory twice. So one is selected anew; a file without attributes has no such
  // fault.
  CDFlib(SELECT_, CDF_, libraryHandle(file, routine), ATTR_, 0L, NULL_);
}

}  // namespace TOLVEX::ambrix
