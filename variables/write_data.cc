#include "variables/write_data.h"

#include <algorithm>
#include <cstddef>
#include <span>
#include <string>
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
#include "variables/library_data.h"
#include "variables/sparse_records.h"
#include "variables/variable_description.h"

namespace TOLVEX::ambrix {
namespace {

std::string countsText(std::span<const long> counts) {
  std::string text = "[";
  for (const long count : counts)
    text += ' ' + std::to_string(count);
  return text + " ]";
}

long hyperslabElements(const VariableDescription& variable, const Hyperslab& slab) {
  const long perValue = variable.datatype == CDF_EPOCH16 ? 2 : 1;
  const long factors[] = {slab.recordCount, variable.elements, perValue, productOf(slab.count)};
  return productOf(factors);
}

bool isLessThanOne(long count) {
  return count < 1;
}

/// The values that the library will read: it looks at as many counts as the variable has
/// dimensions, however many the user gave. None if it refuses a count.
long valuesRead(const VariableDescription& variable, const LibraryHyperslab& slab) {
  const std::span<const long> counts(slab.count.data(), variable.sizes().size());
  const bool refused = slab.recordCount < 1 || std::ranges::any_of(counts, isLessThanOne);
  return refused ? 0 : multiplySaturated(slab.recordCount, productOf(counts));
}

}  // namespace

void putVarData(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const char* routine = "CDFputzVarData";
  const CdfId file = getCdfIdArg(arguments[0]);
  const long number = getLongScalarArg(arguments[1], "VARNUM");
  const long record = getLongScalarArg(arguments[2], "RECNUM");
  std::vector<long> indices = getLongVectorArg(arguments[3], "INDICES");
  const qvArray* data = arguments[4];
  const VariableDescription variable = inquireVariable(file, number);
  if (isRowMajor(file)) std::ranges::reverse(indices);
  if (indices.size() != variable.sizes().size()) {
    raiseError(cdflib::badDimensionExtent(variable.name, variable.dimensions));
  }
  const long expected = elementsPerValue(variable);
  if (!hasElements(data, expected)) {
    raiseError(cdflib::wrongNumberOfPutVarDataElements(variable.name, expected));
  }
  requireClassOfDatatype(data, variable.datatype);
  requireUsableRecord(variable, routine);
  requireRoom(variable, 1, bytesOfArray(data, variable.datatype), routine);
  requireCountableRecord(variable, record, routine);
  // Of a text only the first character is written: users write whole texts as records or
  // hyperslabs.
  const LibraryData value = LibraryData::firstCharacterOf(data);
  DimensionVector libraryIndices = libraryVector(indices, kBadNumber);
  openFileRegistry().markWritten(file);
  callOnVariable(routine, file, number,                               //
                 zVAR_RECNUMBER_, libraryNumber(record, kBadNumber),  //
                 zVAR_DIMINDICES_, libraryIndices.data(),             //
                 PUT_, zVAR_DATA_, value.bytes());
}

void putVarRecordData(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                      const CommandEntry*) {
  const char* routine = "CDFputzVarRecordData";
  const CdfId file = getCdfIdArg(arguments[0]);
  const long number = getLongScalarArg(arguments[1], "VARNUM");
  const long record = getLongScalarArg(arguments[2], "RECNUM");
  const qvArray* data = arguments[3];
  const VariableDescription variable = inquireVariable(file, number);
  const long expected = multiplySaturated(variable.valuesPerRecord(), elementsPerValue(variable));
  if (!hasElements(data, expected)) {
    raiseError(cdflib::wrongNumberOfPutVarRecordDataElements(variable.name, expected));
  }
  requireClassOfDatatype(data, variable.datatype);
  requireUsableRecord(variable, routine);
  requireRoom(variable, variable.valuesPerRecord(), bytesOfArray(data, variable.datatype), routine);
  requireRecordNumber(record, routine);
  requireCountableRecord(variable, record, routine);
  const LibraryData values(data);
  openFileRegistry().markWritten(file);
  checkLibraryStatus(CDFputVarRecordData(libraryHandle(file, routine), kZVariables,
                                         variableOrAttributeNumber(number), record, values.bytes()),
                     routine);
}

void hyperPutVarData(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*) {
  const char* routine = "CDFhyperPutzVarData";
  const CdfId file = getCdfIdArg(arguments[0]);
  const long number = getLongScalarArg(arguments[1], "VARNUM");
  Hyperslab slab = getHyperslabArgs(arguments + 2, "DIMSTRIDE");
  const qvArray* data = arguments[8];
  const VariableDescription variable = inquireVariable(file, number);
  if (isRowMajor(file)) slab.reverseDimensions();
  const long expected = hyperslabElements(variable, slab);
  if (!hasElements(data, expected)) {
    raiseError(cdflib::wrongNumberOfHyperPutVarDataElements(
        countsText(slab.count), slab.recordCount, variable.name, expected));
  }
  requireClassOfDatatype(data, variable.datatype);
  requireUsableRecord(variable, routine);
  const LibraryHyperslab librarySlab(slab, variable.sizes());
  const long count = valuesRead(variable, librarySlab);
  const long bytesPerValue = multiplySaturated(variable.elements, datatypeSize(variable.datatype));
  const std::size_t bytesRead = saturatedProduct({count, bytesPerValue});
  // More counts than dimensions can make the expected number smaller than what the library reads.
  if (bytesRead > bytesOfArray(data, variable.datatype)) {
    raiseLibraryFailure(BAD_DIM_COUNT, routine);
  }
  requireCountableRecord(variable, librarySlab.lastRecord(), routine);
  const LibraryData values(data);
  // Parts of records are put into what the library reads first.
  if (!takesWholeRecords(variable, librarySlab)) writeWaitingRecords(file, number, routine);
  openFileRegistry().markWritten(file);
  moveHyperslab(routine, file, number, librarySlab, PUT_, values.bytes());
}

void deleteVarRecords(int, qvArray*[], std::int32_t, const qvArray* arguments[],
                      const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long number = getLongScalarArg(arguments[1], "VARNUM");
  const long first = getLongScalarArg(arguments[2], "STARTREC");
  const long last = getLongScalarArg(arguments[3], "ENDREC");
  const char* routine = "CDFdeletezVarRecords";
  requireDivisibleRecord(file, inquireVariable(file, number, routine), routine);
  callOnVariable(routine, file, number, DELETE_, zVAR_RECORDS_,  //
                 libraryNumber(first, kBadNumber), libraryNumber(last, kBadNumber));
}

}  // namespace TOLVEX::ambrix
