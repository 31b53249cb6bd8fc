#include "variables/pad_values.h"

#include <algorithm>

#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/library_calls.h"
#include "gateway/open_file_registry.h"
#include "gateway/raise_error.h"
#include "gateway/scratch.h"
#include "variables/bytes_to_write.h"
#include "variables/datatypes.h"
#include "variables/host_dimensions.h"
#include "variables/read_values.h"
#include "variables/variable_description.h"

namespace TOLVEX::ambrix {
namespace {

/// A text is released before its status is looked at.
long putPadValue(const VariableOperation& variable, const qvArray* value) {
  if (qvGetClassID(value) != qvCHAR_CLASS) {
    return variable.status(PUT_, zVAR_PADVALUE_, qvGetReadOnlyData(value));
  }
  const HostString text(qvArrayToString(value));
  return variable.status(PUT_, zVAR_PADVALUE_, text.get());
}

}  // namespace

void getVarPadValue(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                    const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  const VariableDescription description = inquireVariable(file, variableNumber);
  const VariableOperation variable(file, variableNumber, "CDFgetzVarPadValue");
  const HostDimensions dimensions = valueDimensions(description);
  validateDatatype(description.datatype);
  requireElements(variable, description);
  // More room than one value needs, and never less whatever sizes a damaged file gives.
  const long bufferBytes = std::max(description.elementsPerRecord(), description.elements);
  // Of a text that has no pad value in its file the library writes the first character only.
  constexpr bool kWritesAll = false;
  const ReadRequest request{1, bufferBytes, kWritesAll};
  outputs[0] = readValues(variable, description, dimensions, request,
                          [&](void* value) { variable.call(GET_, zVAR_PADVALUE_, value); });
}

void setVarPadValue(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                    const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  const qvArray* value = arguments[2];
  const VariableDescription description = inquireVariable(file, variableNumber);
  const VariableOperation variable(file, variableNumber, "CDFsetzVarPadValue");
  requireClassOfDatatype(value, description.datatype);
  const long expected = elementsPerValue(description);
  if (!hasElements(value, expected)) {
    raiseError(cdflib::wrongNumberOfPadValueElements(description.name, expected));
  }
  requireElements(variable, description);
  requireDivisibleRecord(variable, description);
  requireRoom(variable, description, 1, bytesOfArray(value, description.datatype));
  variable.check(putPadValue(variable, value));
}

}  // namespace TOLVEX::ambrix
