#include "variables/variable_description.h"

#include <algorithm>
#include <cstddef>

#include "gateway/sizes.h"
#include "variables/datatypes.h"

namespace TOLVEX::ambrix {

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

bool VariableDescription::storesOneValue() const {
  return storedBytesPerRecord() == multiplySaturated(elements, datatypeSize(datatype));
}

long describe(const VariableOperation& variable, VariableDescription& found) {
  const long status =
      variable.status(GET_,                                                               //
                      zVAR_NAME_, found.name,                                             //
                      zVAR_DATATYPE_, &found.datatype,                                    //
                      zVAR_NUMELEMS_, &found.elements,                                    //
                      zVAR_NUMDIMS_, &found.dimensions, zVAR_DIMSIZES_, found.sizeSlots,  //
                      zVAR_RECVARY_, &found.recordVariance, zVAR_DIMVARYS_, found.varianceSlots);
  const bool countable = found.dimensions >= 0 && found.dimensions <= CDF_MAX_DIMS;
  if (status >= CDF_OK && !countable) variable.fail(BAD_NUM_DIMS);
  return status;
}

VariableDescription inquireVariable(CdfId file, long variableNumber) {
  const VariableOperation inquiry(file, variableNumber, "CDFinquirezVar");
  VariableDescription found;
  inquiry.check(describe(inquiry, found));
  return found;
}

}  // namespace TOLVEX::ambrix
