#include "variables/variance.h"

#include <cdf.h>

#include <cstddef>

#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {

std::vector<long> getVarianceArg(const qvArray* argument) {
  std::vector<long> variances(qvGetNumberOfElements(argument));
  if (qvGetClassID(argument) == qvLOGICAL_CLASS) {
    const bool* logicals = qvGetLogicals(argument);
    for (std::size_t i = 0; i < variances.size(); ++i)
      variances[i] = logicals[i] ? VARY : NOVARY;
    return variances;
  }
  if (qvGetClassID(argument) != qvDOUBLE_CLASS) raiseError(cdflib::badVarianceDatatype());
  const auto* doubles = static_cast<const double*>(qvGetReadOnlyData(argument));
  for (std::size_t i = 0; i < variances.size(); ++i) {
    variances[i] = truncateToLong(doubles[i]);
    validateVariance(variances[i]);
  }
  return variances;
}

void validateVariance(long variance) {
  if (variance != VARY && variance != NOVARY) {
    raiseError(cdflib::unrecognizedValue(variance, "VARIANCE"));
  }
}

bool varies(long variance) {
  validateVariance(variance);
  return variance == VARY;
}

}  // namespace TOLVEX::ambrix
