#include "variables/read_data.h"

#include <algorithm>
#include <cstddef>
#include <vector>

#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/open_file_registry.h"
#include "gateway/raise_error.h"
#include "gateway/sizes.h"
#include "variables/datatypes.h"
#include "variables/guards/record_limits.h"
#include "variables/guards/unwritten_record.h"
#include "variables/guards/waiting_records.h"
#include "variables/host_dimensions.h"
#include "variables/hyperslab.h"
#include "variables/read_values.h"
#include "variables/variable_description.h"

namespace TOLVEX::ambrix {
namespace {

void requireOnePerDimension(const std::vector<long>& numbers,
                            const VariableDescription& description) {
  if (numbers.size() != description.sizes().size()) {
    raiseError(cdflib::badDimSpec(description.dimensions, description.name));
  }
}

std::vector<long> getOptionalIndices(std::int32_t argumentCount, const qvArray* arguments[],
                                     const VariableDescription& description) {
  if (argumentCount > 3) return getLongVectorArg(arguments[3], "INDICES");
  if (description.dimensions > 0) raiseError(cdflib::cannotOmitDimSpec());
  return {};
}

void readHyperslab(const VariableOperation& variable, const VariableDescription& description,
                   const LibraryHyperslab& slab, void* result) {
  const auto read = [&](void* values) {
    variable.check(moveHyperslab(variable, slab, GET_, values));
  };
  if (takesWholeRecords(description, slab)) {
    return readWholeRecords(variable, description, slab.records(), result, read);
  }
  writeWaitingRecords(variable, description, slab.records());
  read(result);
}

}  // namespace

// The readers and writers check a record in one order: its size (`requireUsableRecord`), the room
// for its values (`requireRoom`), then its number. A writer's room is that of its argument. A
// reader's room is that of its result, so a reader checks the number after `readValues` has made
// the result, and the host's error for a result that is too large comes first.

void getVarData(int, qvArray* outputs[], std::int32_t argumentCount, const qvArray* arguments[],
                const CommandEntry*) {
  // 1. Arguments: in this order. The indices come after the inquiry, which says if they are needed.
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  const long record = getLongScalarArg(arguments[2], "RECNUM");
  const VariableDescription description = inquireVariable(file, variableNumber);
  std::vector<long> indices = getOptionalIndices(argumentCount, arguments, description);
  requireOnePerDimension(indices, description);
  if (isRowMajor(file)) std::ranges::reverse(indices);
  const HostDimensions dimensions = valueDimensions(description);
  validateDatatype(description.datatype);

  // 2. Request: the size of a record is checked before it is multiplied or reserved.
  const VariableOperation variable(file, variableNumber, "CDFgetzVarData");
  requireUsableRecord(variable, description);
  const ReadRequest request{1, description.elementsPerRecord(), true};
  const DimensionVector libraryIndices = libraryVector(indices, kBadNumber);
  const long libraryRecord = libraryNumber(record, kBadNumber);
  const auto readValue = [&](void* value) {
    variable.call(zVAR_RECNUMBER_, libraryRecord,           //
                  zVAR_DIMINDICES_, libraryIndices.data(),  //
                  GET_, zVAR_DATA_, value);
  };
  // 3. Result: made first, then the record is checked, then filled or read. A value that is a whole
  // record takes the path of whole records, which has their guard.
  outputs[0] = readValues(variable, description, dimensions, request, [&](void* value) {
    requireCountableRecord(variable, description, record);
    if (mustFillUnwrittenRecord(variable, description)) {
      return fillValue(variable, description, record, libraryIndices, value);
    }
    if (!description.storesOneValue()) return readValue(value);
    readWholeRecords(variable, description, {libraryRecord, 1, 1}, value, readValue);
  });
}

void getVarRecordData(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                      const CommandEntry*) {
  // 1. Arguments: in this order. The datatype is checked before the majority is asked for.
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  const long record = getLongScalarArg(arguments[2], "RECNUM");
  const VariableDescription description = inquireVariable(file, variableNumber);
  validateDatatype(description.datatype);
  const HostDimensions dimensions = recordDimensions(description, isRowMajor(file));

  // 2. Request: the size of a record is checked before it is multiplied or reserved.
  const VariableOperation variable(file, variableNumber, "CDFgetzVarRecordData");
  requireUsableRecord(variable, description);
  const ReadRequest request{description.valuesPerRecord(), description.elementsPerRecord(),
                            description.allDimensionsVary()};
  const auto readRecord = [&](void* values) {
    variable.check(
        CDFgetVarRecordData(variable.handle(), kZVariables, variable.number(), record, values));
  };
  // 3. Result: made first, then the record is checked, then filled or read.
  outputs[0] = readValues(variable, description, dimensions, request, [&](void* values) {
    requireRecordNumber(variable, record);
    requireCountableRecord(variable, description, record);
    if (mustFillUnwrittenRecord(variable, description))
      return fillRecord(variable, description, values);
    readWholeRecords(variable, description, {record, 1, 1}, values, readRecord);
  });
}

void hyperGetVarData(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*) {
  // 1. Arguments: in this order. Counts are compared with the sizes before the datatype is checked.
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  Hyperslab slab = getHyperslabArgs(arguments + 2, "DIMSTRIDe");  // the writer: "DIMSTRIDE"
  const VariableDescription description = inquireVariable(file, variableNumber);
  requireOnePerDimension(slab.start, description);
  requireOnePerDimension(slab.count, description);
  requireOnePerDimension(slab.interval, description);
  const bool rowMajor = isRowMajor(file);
  if (rowMajor) slab.reverseDimensions();
  HostDimensions dimensions = hyperslabDimensions(description, slab.count, slab.recordCount);
  validateDatatype(description.datatype);
  if (rowMajor) reverseCounts(dimensions, slab.count.size());

  // 2. Request: the size of a record is checked before it is multiplied or reserved.
  const VariableOperation variable(file, variableNumber, "CDFhyperGetzVarData");
  requireUsableRecord(variable, description);
  const long values = multiplySaturated(productOf(slab.count), slab.recordCount);
  const long bufferBytes = multiplySaturated(description.elementsPerRecord(), slab.recordCount);
  const ReadRequest request{values, bufferBytes, true};
  LibraryHyperslab librarySlab(slab, description.sizes());
  readSameRecordWithoutSkipping(description, librarySlab);
  // 3. Result: made first, then the last record is checked, then filled or read.
  outputs[0] = readValues(variable, description, dimensions, request, [&](void* result) {
    requireCountableRecord(variable, description, librarySlab.lastRecord());
    if (mustFillUnwrittenRecord(variable, description)) {
      return fillHyperslab(variable, description, librarySlab, result);
    }
    readHyperslab(variable, description, librarySlab, result);
  });
}

}  // namespace TOLVEX::ambrix
