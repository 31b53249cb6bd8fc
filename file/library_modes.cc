#include "file/library_modes.h"

#include <cdf.h>

#include "constants/value_names.h"
#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {

void getValidate(int, qvArray* outputs[], std::int32_t, const qvArray*[], const CommandEntry*) {
  const int mode = CDFgetValidate();
  outputs[0] = qvCreateString(lookupValueName(ValidateModeNames, mode, "VALIDATION MODE").c_str());
}

// Takes -1 for on although "getValidate" knows 1 as on: each follows its own side of the library.
void setValidate(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const long mode = getLongScalarArg(arguments[0], "MODE");
  if (mode != VALIDATEFILEoff && mode != VALIDATEFILEon) {
    raiseError(cdflib::unrecognizedValue(mode, "file validation mode"));
  }
  CDFsetValidate(mode);
}

void getFileBackward(int, qvArray* outputs[], std::int32_t, const qvArray*[], const CommandEntry*) {
  const int mode = CDFgetFileBackward();
  outputs[0] =
      qvCreateString(lookupValueName(BackwardFileModeNames, mode, "BACKWARDS FILE MODE").c_str());
}

void setFileBackward(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*) {
  const long mode = getLongScalarArg(arguments[0], "MODE");
  if (mode != BACKWARDFILEoff && mode != BACKWARDFILEon) {
    raiseError(cdflib::unrecognizedValue(mode, "BACKWARD MODE"));
  }
  CDFsetFileBackward(static_cast<int>(mode));
}

}  // namespace TOLVEX::ambrix
