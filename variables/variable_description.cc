#include "variables/variable_description.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <limits>

#include "gateway/library.h"
#include "gateway/sizes.h"
#include "variables/datatypes.h"

namespace TOLVEX::ambrix {
namespace {

// Of the datatypes that the library knows and the module does not support.
constexpr long kOtherDatatypeSize = 8;

}  // namespace

long VariableDescription::valuesPerRecord() const {
  return productOf(sizes());
}

long VariableDescription::elementsPerRecord() const {
  return multiplySaturated(elements, valuesPerRecord());
}

long VariableDescription::storedBytesPerRecord() const {
  long bytes = multiplySaturated(elements, datatypeSize(datatype));
  for (std::size_t i = 0; i < count(); ++i) {
    if (varianceSlots[i] != NOVARY) bytes = multiplySaturated(bytes, sizeSlots[i]);
  }
  return bytes;
}

bool VariableDescription::allDimensionsVary() const {
  return std::ranges::all_of(variances(), [](long variance) { return variance == VARY; });
}

VariableDescription inquireVariable(CdfId file, long variable, const char* routine) {
  VariableDescription found;
  callOnVariable(routine, file, variable, GET_,                                      //
                 zVAR_NAME_, found.name,                                             //
                 zVAR_DATATYPE_, &found.datatype,                                    //
                 zVAR_NUMELEMS_, &found.elements,                                    //
                 zVAR_NUMDIMS_, &found.dimensions, zVAR_DIMSIZES_, found.sizeSlots,  //
                 zVAR_RECVARY_, &found.recordVariance, zVAR_DIMVARYS_, found.varianceSlots);
  const bool countable = found.dimensions >= 0 && found.dimensions <= CDF_MAX_DIMS;
  if (!countable) raiseLibraryFailure(BAD_NUM_DIMS, routine);
  return found;
}

void requireRecordNumber(long record, const char* routine) {
  if (record < 0 || !fitsLibrary(record)) raiseLibraryFailure(BAD_REC_NUM, routine);
}

void requireCountableRecord(const VariableDescription& variable, long record, const char* routine) {
  const bool countable = record != std::numeric_limits<std::int32_t>::max();
  if (variable.recordVariance != NOVARY && !countable) raiseLibraryFailure(BAD_REC_NUM, routine);
}

void requireElements(const VariableDescription& variable, const char* routine) {
  if (variable.elements < 1) raiseLibraryFailure(BAD_NUM_ELEMS, routine);
}

void requireUsableRecord(const VariableDescription& variable, const char* routine) {
  requireElements(variable, routine);
  if (std::ranges::any_of(variable.sizes(), [](long size) { return size < 1; })) {
    raiseLibraryFailure(BAD_DIM_SIZE, routine);
  }
  if (variable.storedBytesPerRecord() > std::numeric_limits<std::int32_t>::max()) {
    raiseLibraryFailure(BAD_DIM_SIZE, routine);
  }
}

void requireDivisibleRecord(CdfId file, const VariableDescription& variable, const char* routine) {
  const long supportedSize = datatypeSize(variable.datatype);
  const long elementSize = supportedSize > 0 ? supportedSize : kOtherDatatypeSize;
  auto bytes = static_cast<std::uint32_t>(variable.elements);
  bytes *= static_cast<std::uint32_t>(elementSize);
  for (std::size_t i = 0; i < variable.sizes().size(); ++i) {
    if (variable.variances()[i] != NOVARY) bytes *= static_cast<std::uint32_t>(variable.sizes()[i]);
  }
  if (bytes == 0 && isSingleFile(file, routine)) raiseLibraryFailure(BAD_DIM_SIZE, routine);
}

void requireRoom(const VariableDescription& variable, long values, std::size_t bytes,
                 const char* routine) {
  const std::size_t needed =
      saturatedProduct({values, variable.elements, datatypeSize(variable.datatype)});
  if (needed > bytes) raiseLibraryFailure(BAD_NUM_ELEMS, routine);
}

}  // namespace TOLVEX::ambrix
