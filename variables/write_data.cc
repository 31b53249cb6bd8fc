#include "variables/write_data.h"

#include <algorithm>
#include <cstddef>
#include <span>
#include <string>
#include <vector>

#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/open_file_registry.h"
#include "gateway/raise_error.h"
#include "gateway/sizes.h"
#include "variables/bytes_to_write.h"
#include "variables/datatypes.h"
#include "variables/guards/record_limits.h"
#include "variables/guards/waiting_records.h"
#include "variables/host_dimensions.h"
#include "variables/hyperslab.h"
#include "variables/variable_description.h"

namespace TOLVEX::ambrix {
namespace {

std::string countsText(std::span<const long> counts) {
  std::string text = "[";
  for (const long count : counts)
    text += ' ' + std::to_string(count);
  return text + " ]";
}

long hyperslabElements(const VariableDescription& description, const Hyperslab& slab) {
  const long perValue = description.datatype == CDF_EPOCH16 ? 2 : 1;
  const long factors[] = {slab.recordCount, description.elements, perValue, productOf(slab.count)};
  return productOf(factors);
}

bool isLessThanOne(long count) {
  return count < 1;
}

/// The bytes that the library will read: it looks at as many counts as the variable has dimensions,
/// however many the user gave. None if it refuses a count.
std::size_t bytesRead(const VariableDescription& description, const LibraryHyperslab& slab) {
  const std::span<const long> counts(slab.count.data(), description.sizes().size());
  const bool refused = slab.recordCount < 1 || std::ranges::any_of(counts, isLessThanOne);
  if (refused) return 0;
  return saturatedProduct({slab.recordCount, productOf(counts), description.elements,
                           datatypeSize(description.datatype)});
}

/// What the library has carried out counts as written, also if it has warned of something.
void finishWriting(const VariableOperation& variable, long status) {
  if (status > CDF_WARN) openFileRegistry().markWritten(variable.file());
  variable.check(status);
}

}  // namespace

// The checks of a record come in the order of the readers (variables/read_data.cc): size, room,
// number.

void putVarData(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  // 1. Arguments: in this order. The number of elements is checked before the class.
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  const long record = getLongScalarArg(arguments[2], "RECNUM");
  std::vector<long> indices = getLongVectorArg(arguments[3], "INDICES");
  const qvArray* data = arguments[4];
  const VariableDescription description = inquireVariable(file, variableNumber);
  if (isRowMajor(file)) std::ranges::reverse(indices);
  if (indices.size() != description.sizes().size()) {
    raiseError(cdflib::badDimensionExtent(description.name, description.dimensions));
  }
  const long expected = elementsPerValue(description);
  if (!hasElements(data, expected)) {
    raiseError(cdflib::wrongNumberOfPutVarDataElements(description.name, expected));
  }
  requireClassOfDatatype(data, description.datatype);

  // 2. Record: its size, the room for a value, its number.
  const VariableOperation variable(file, variableNumber, "CDFputzVarData");
  requireUsableRecord(variable, description);
  requireRoom(variable, description, 1, bytesOfArray(data, description.datatype));
  requireCountableRecord(variable, description, record);
  // 3. Writing. Of a text only the first character is written: records and hyperslabs are for whole
  // texts.
  const BytesToWrite value = BytesToWrite::firstCharacterOf(data);
  const DimensionVector libraryIndices = libraryVector(indices, kBadNumber);
  finishWriting(variable, variable.status(zVAR_RECNUMBER_, libraryNumber(record, kBadNumber),  //
                                          zVAR_DIMINDICES_, libraryIndices.data(),             //
                                          PUT_, zVAR_DATA_, value.bytes()));
}

void putVarRecordData(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                      const CommandEntry*) {
  // 1. Arguments: in this order. The number of elements is checked before the class.
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  const long record = getLongScalarArg(arguments[2], "RECNUM");
  const qvArray* data = arguments[3];
  const VariableDescription description = inquireVariable(file, variableNumber);
  const long valueCount = description.valuesPerRecord();
  const long expected = multiplySaturated(valueCount, elementsPerValue(description));
  if (!hasElements(data, expected)) {
    raiseError(cdflib::wrongNumberOfPutVarRecordDataElements(description.name, expected));
  }
  requireClassOfDatatype(data, description.datatype);

  // 2. Record: its size, the room for its values, its number.
  const VariableOperation variable(file, variableNumber, "CDFputzVarRecordData");
  requireUsableRecord(variable, description);
  requireRoom(variable, description, valueCount, bytesOfArray(data, description.datatype));
  requireRecordNumber(variable, record);
  requireCountableRecord(variable, description, record);
  // 3. Writing.
  const BytesToWrite values(data);
  finishWriting(variable, CDFputVarRecordData(variable.handle(), kZVariables, variable.number(),
                                              record, values.bytes()));
}

void hyperPutVarData(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*) {
  // 1. Arguments: in this order. The number of elements is checked before the class.
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  Hyperslab slab = getHyperslabArgs(arguments + 2, "DIMSTRIDE");
  const qvArray* data = arguments[8];
  const VariableDescription description = inquireVariable(file, variableNumber);
  if (isRowMajor(file)) slab.reverseDimensions();
  const long expected = hyperslabElements(description, slab);
  if (!hasElements(data, expected)) {
    raiseError(cdflib::wrongNumberOfHyperPutVarDataElements(
        countsText(slab.count), slab.recordCount, description.name, expected));
  }
  requireClassOfDatatype(data, description.datatype);

  // 2. Records: their size, the room for the values, the last number.
  const VariableOperation variable(file, variableNumber, "CDFhyperPutzVarData");
  requireUsableRecord(variable, description);
  const LibraryHyperslab librarySlab(slab, description.sizes());
  // More counts than dimensions can make the expected number smaller than what the library reads.
  if (bytesRead(description, librarySlab) > bytesOfArray(data, description.datatype)) {
    variable.fail(BAD_DIM_COUNT);
  }
  requireCountableRecord(variable, description, librarySlab.lastRecord());
  // 3. Writing. To write a part of a record the library reads the record first, so it is guarded as
  // reading is.
  const BytesToWrite values(data);
  if (!takesWholeRecords(description, librarySlab)) {
    writeWaitingRecords(variable, description, {librarySlab.recordStart, 1, 1});
  }
  finishWriting(variable, moveHyperslab(variable, librarySlab, PUT_, values.bytes()));
}

void deleteVarRecords(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                      const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long variableNumber = getLongScalarArg(arguments[1], "VARNUM");
  const long first = libraryNumber(getLongScalarArg(arguments[2], "STARTREC"), kBadNumber);
  const long last = libraryNumber(getLongScalarArg(arguments[3], "ENDREC"), kBadNumber);
  const VariableOperation variable(file, variableNumber, "CDFdeletezVarRecords");
  requireDivisibleRecord(variable);
  variable.call(DELETE_, zVAR_RECORDS_, first, last);
}

}  // namespace TOLVEX::ambrix
