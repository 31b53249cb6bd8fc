#include "variables/host_dimensions.h"

#include <algorithm>
#include <cstddef>

#include "gateway/errors.h"
#include "gateway/library.h"
#include "gateway/raise_error.h"
#include "variables/datatypes.h"

namespace TOLVEX::ambrix {
namespace {

// The elements of one value are contiguous to the library: they come first and never move.
bool appendLeading(HostDimensions& dimensions, const VariableDescription& variable) {
  if (variable.datatype == CDF_EPOCH16) {
    dimensions.append(2);
    return true;
  }
  if (isCharacterDatatype(variable.datatype)) {
    dimensions.append(variable.elements);
    return true;
  }
  return false;
}

}  // namespace

void HostDimensions::reverse(std::size_t first, std::size_t last) {
  auto* begin = sizes_.data();
  std::reverse(begin + first, begin + last);
}

HostDimensions valueDimensions(const VariableDescription& variable) {
  HostDimensions dimensions;
  if (!appendLeading(dimensions, variable)) dimensions.append(1);
  dimensions.append(1);
  return dimensions;
}

HostDimensions recordDimensions(const VariableDescription& variable, bool rowMajor) {
  HostDimensions dimensions;
  const bool scalar = variable.dimensions == 0;
  const bool text = isCharacterDatatype(variable.datatype);
  if (variable.datatype == CDF_EPOCH16 || (text && variable.elements != 1)) {
    appendLeading(dimensions, variable);
  } else if (scalar) {
    dimensions.append(variable.elements);
  }
  const std::size_t leading = scalar ? 0 : dimensions.count();
  for (const long size : variable.sizes())
    dimensions.append(size);
  if (rowMajor && !scalar) dimensions.reverse(leading, dimensions.count());
  return dimensions;
}

HostDimensions hyperslabDimensions(const VariableDescription& variable,
                                   std::span<const long> counts, long records) {
  HostDimensions dimensions;
  appendLeading(dimensions, variable);
  for (std::size_t i = 0; i < counts.size(); ++i) {
    if (variable.sizes()[i] < counts[i]) raiseError(cdflib::dimSizeTooLarge());
    dimensions.append(counts[i]);
  }
  dimensions.append(records);
  return dimensions;
}

void reverseCounts(HostDimensions& dimensions, std::size_t counts) {
  const std::size_t records = dimensions.count() - 1;
  dimensions.reverse(records - counts, records);
}

DimensionVector libraryVector(std::span<const long> values, long refused) {
  DimensionVector vector{};
  const std::size_t given = std::min(values.size(), vector.size());
  for (std::size_t i = 0; i < given; ++i)
    vector[i] = libraryNumber(values[i], refused);
  return vector;
}

}  // namespace TOLVEX::ambrix
