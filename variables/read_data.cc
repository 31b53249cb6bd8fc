#include "variables/read_data.h"

#include <algorithm>
#include <cstddef>
#include <vector>

#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/library.h"
#include "gateway/open_file_registry.h"
#include "gateway/raise_error.h"
#include "gateway/sizes.h"
#include "variables/datatypes.h"
#include "variables/host_dimensions.h"
#include "variables/hyperslab.h"
#include "variables/read_values.h"
#include "variables/sparse_records.h"
#include "variables/unwritten_record.h"
#include "variables/variable_description.h"

namespace TOLVEX::ambrix {
namespace {

void requireOnePerDimension(const std::vector<long>& numbers, const VariableDescription& variable) {
  if (numbers.size() != variable.sizes().size()) {
    raiseError(cdflib::badDimSpec(variable.dimensions, variable.name));
  }
}

std::vector<long> getOptionalIndices(std::int32_t argumentCount, const qvArray* arguments[],
                                     const VariableDescription& variable) {
  if (argumentCount > 3) return getLongVectorArg(arguments[3], "INDICES");
  if (variable.dimensions > 0) raiseError(cdflib::cannotOmitDimSpec());
  return {};
}

}  // namespace

void getVarData(int, qvArray* outputs[], std::int32_t argumentCount, const qvArray* arguments[],
                const CommandEntry*) {
  const char* routine = "CDFgetzVarData";
  const CdfId file = getCdfIdArg(arguments[0]);
  const long number = getLongScalarArg(arguments[1], "VARNUM");
  const long record = getLongScalarArg(arguments[2], "RECNUM");
  const VariableDescription variable = inquireVariable(file, number);
  std::vector<long> indices = getOptionalIndices(argumentCount, arguments, variable);
  requireOnePerDimension(indices, variable);
  if (isRowMajor(file)) std::ranges::reverse(indices);
  const HostDimensions dimensions = valueDimensions(variable);
  validateDatatype(variable.datatype);
  const ReadRequest request{routine, 1, variable.elementsPerRecord(), true};
  requireUsableRecord(variable, routine);
  DimensionVector libraryIndices = libraryVector(indices, kBadNumber);
  writeWaitingRecords(file, number, routine);
  outputs[0] = readValues(variable, dimensions, request, [&](void* buffer) {
    requireCountableRecord(variable, record, routine);
    if (lacksItsRecord(file, number, variable, routine)) {
      return fillValue(file, number, variable, record, libraryIndices, buffer, routine);
    }
    callOnVariable(routine, file, number,                               //
                   zVAR_RECNUMBER_, libraryNumber(record, kBadNumber),  //
                   zVAR_DIMINDICES_, libraryIndices.data(),             //
                   GET_, zVAR_DATA_, buffer);
  });
}

void getVarRecordData(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                      const CommandEntry*) {
  const char* routine = "CDFgetzVarRecordData";
  const CdfId file = getCdfIdArg(arguments[0]);
  const long number = getLongScalarArg(arguments[1], "VARNUM");
  const long record = getLongScalarArg(arguments[2], "RECNUM");
  const VariableDescription variable = inquireVariable(file, number);
  validateDatatype(variable.datatype);
  const HostDimensions dimensions = recordDimensions(variable, isRowMajor(file));
  const ReadRequest request{routine, variable.valuesPerRecord(), variable.elementsPerRecord(),
                            variable.allDimensionsVary()};
  requireUsableRecord(variable, routine);
  writeWaitingRecords(file, number, routine);
  outputs[0] = readValues(variable, dimensions, request, [&](void* buffer) {
    requireRecordNumber(record, routine);
    requireCountableRecord(variable, record, routine);
    if (lacksItsRecord(file, number, variable, routine)) {
      return fillRecord(file, number, variable, buffer, routine);
    }
    checkLibraryStatus(CDFgetVarRecordData(libraryHandle(file, routine), kZVariables,
                                           variableOrAttributeNumber(number), record, buffer),
                       routine);
  });
}

void hyperGetVarData(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*) {
  const char* routine = "CDFhyperGetzVarData";
  const CdfId file = getCdfIdArg(arguments[0]);
  const long number = getLongScalarArg(arguments[1], "VARNUM");
  Hyperslab slab = getHyperslabArgs(arguments + 2, "DIMSTRIDe");  // users know this spelling
  const VariableDescription variable = inquireVariable(file, number);
  requireOnePerDimension(slab.start, variable);
  requireOnePerDimension(slab.count, variable);
  requireOnePerDimension(slab.interval, variable);
  const bool rowMajor = isRowMajor(file);
  if (rowMajor) slab.reverseDimensions();
  HostDimensions dimensions = hyperslabDimensions(variable, slab.count, slab.recordCount);
  validateDatatype(variable.datatype);
  if (rowMajor) reverseCounts(dimensions, slab.count.size());
  const long values = multiplySaturated(productOf(slab.count), slab.recordCount);
  const long bufferBytes = multiplySaturated(variable.elementsPerRecord(), slab.recordCount);
  const ReadRequest request{routine, values, bufferBytes, true};
  requireUsableRecord(variable, routine);
  LibraryHyperslab librarySlab(slab, variable.sizes());
  skipNoRecordsThatDoNotVary(variable, librarySlab);
  writeWaitingRecords(file, number, routine);
  outputs[0] = readValues(variable, dimensions, request, [&](void* buffer) {
    requireCountableRecord(variable, librarySlab.lastRecord(), routine);
    if (lacksItsRecord(file, number, variable, routine)) {
      return fillHyperslab(file, number, variable, librarySlab, buffer, routine);
    }
    moveHyperslab(routine, file, number, librarySlab, GET_, buffer);
  });
}

}  // namespace TOLVEX::ambrix
