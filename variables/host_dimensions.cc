#include "variables/host_dimensions.h"

#include <algorithm>
#include <cstddef>

#include "gateway/errors.h"
#include "gateway/library_calls.h"
#include "gateway/raise_error.h"
#include "variables/datatypes.h"

namespace TOLVEX::ambrix {
namespace {

// The elements of one value are contiguous to the library: they come first and never move.
bool appendLeading(HostDimensions& dimensions, const VariableDescription& description) {
  if (description.datatype == CDF_EPOCH16) {
    dimensions.append(2);
    return true;
  }
  if (isCharacterDatatype(description.datatype)) {
    dimensions.append(description.elements);
    return true;
  }
  return false;
}

}  // namespace

void HostDimensions::reverse(std::size_t first, std::size_t last) {
  auto* begin = sizes_.data();
  std::reverse(begin + first, begin + last);
}

HostDimensions valueDimensions(const VariableDescription& description) {
  HostDimensions dimensions;
  if (!appendLeading(dimensions, description)) dimensions.append(1);
  dimensions.append(1);
  return dimensions;
}

HostDimensions recordDimensions(const VariableDescription& description, bool rowMajor) {
  HostDimensions dimensions;
  const bool scalar = description.dimensions == 0;
  const bool text = isCharacterDatatype(description.datatype);
  if (description.datatype == CDF_EPOCH16 || (text && description.elements != 1)) {
    appendLeading(dimensions, description);
  } else if (scalar) {
    dimensions.append(description.elements);
  }
  const std::size_t leading = scalar ? 0 : dimensions.count();
  for (const long size : description.sizes())
    dimensions.append(size);
  if (rowMajor && !scalar) dimensions.reverse(leading, dimensions.count());
  return dimensions;
}

HostDimensions hyperslabDimensions(const VariableDescription& description,
                                   std::span<const long> counts, long records) {
  HostDimensions dimensions;
  appendLeading(dimensions, description);
  for (std::size_t i = 0; i < counts.size(); ++i) {
    if (description.sizes()[i] < counts[i]) raiseError(cdflib::dimSizeTooLarge());
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
