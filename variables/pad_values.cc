#include "variables/pad_values.h"

#include <algorithm>

#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/library.h"
#include "gateway/open_file_registry.h"
#include "gateway/raise_error.h"
#include "variables/datatypes.h"
#include "variables/host_dimensions.h"
#include "variables/library_data.h"
#include "variables/read_values.h"
#include "variables/variable_description.h"

namespace TOLVEX::ambrix {

void getVarPadValue(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                    const CommandEntry*) {
  const char* routine = "CDFgetzVarPadValue";
  const CdfId file = getCdfIdArg(arguments[0]);
  const long number = getLongScalarArg(arguments[1], "VARNUM");
  const VariableDescription variable = inquireVariable(file, number);
  const HostDimensions dimensions = valueDimensions(variable);
  validateDatatype(variable.datatype);
  requireElements(variable, routine);
  // More room than one value needs, and never less whatever sizes a damaged file gives.
  const long bufferBytes = std::max(variable.elementsPerRecord(), variable.elements);
  // Of a text that has no pad value in its file the library writes the first character only.
  constexpr bool kWritesAll = false;
  const ReadRequest request{routine, 1, bufferBytes, kWritesAll};
  outputs[0] = readValues(variable, dimensions, request, [&](void* buffer) {
    callOnVariable(routine, file, number, GET_, zVAR_PADVALUE_, buffer);
  });
}

void setVarPadValue(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                    const CommandEntry*) {
  const char* routine = "CDFsetzVarPadValue";
  const CdfId file = getCdfIdArg(arguments[0]);
  const long number = getLongScalarArg(arguments[1], "VARNUM");
  const qvArray* value = arguments[2];
  const VariableDescription variable = inquireVariable(file, number);
  requireClassOfDatatype(value, variable.datatype);
  const long expected = elementsPerValue(variable);
  if (!hasElements(value, expected)) {
    raiseError(cdflib::wrongNumberOfPadValueElements(variable.name, expected));
  }
  requireElements(variable, routine);
  requireDivisibleRecord(file, variable, routine);
  requireRoom(variable, 1, bytesOfArray(value, variable.datatype), routine);
  const LibraryData data(value);
  callOnVariable(routine, file, number, PUT_, zVAR_PADVALUE_, data.bytes());
}

}  // namespace TOLVEX::ambrix
