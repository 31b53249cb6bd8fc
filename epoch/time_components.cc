#include "epoch/time_components.h"

#include <cstdint>

#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {

std::size_t requireGroups(const qvArray* components, std::size_t size) {
  const std::size_t elements = qvGetNumberOfElements(components);
  if (elements % size != 0 || qvGetClassID(components) != qvDOUBLE_CLASS) {
    raiseError(cdflib::badEpochVector(static_cast<std::int64_t>(size)));
  }
  return elements / size;
}

std::span<const double> componentsOf(const qvArray* times) {
  return {static_cast<const double*>(qvGetReadOnlyData(times)), qvGetNumberOfElements(times)};
}

void raiseIllegalTime(std::span<const double> later) {
  requireInRange(later);
  raiseError(cdflib::illegalEpochValue());
}

}  // namespace TOLVEX::ambrix
