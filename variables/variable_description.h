// What the library says of a variable, in one inquiry.
#pragma once

#include <cdf.h>

#include <span>

#include "gateway/library_calls.h"

namespace TOLVEX::ambrix {

struct VariableDescription {
  char name[CDF_VAR_NAME_LEN256 + 1] = {};
  long datatype = 0;
  long elements = 0;  // characters of one value; 1 for every other datatype of a sane file
  long dimensions = 0;
  long recordVariance = 0;
  long sizeSlots[CDF_MAX_DIMS] = {};
  long varianceSlots[CDF_MAX_DIMS] = {};

  // In the library's order of dimensions.
  [[nodiscard]] std::span<const long> sizes() const { return {sizeSlots, count()}; }
  [[nodiscard]] std::span<const long> variances() const { return {varianceSlots, count()}; }

  /// Product of all dimension sizes, whatever their variances; 1 for a scalar variable.
  [[nodiscard]] long valuesPerRecord() const;
  /// The same in elements: characters for text.
  [[nodiscard]] long elementsPerRecord() const;
  /// The same in bytes, of what the library stores: along a dimension that does not vary, one
  /// value.
  [[nodiscard]] long storedBytesPerRecord() const;
  [[nodiscard]] bool allDimensionsVary() const;
  /// Whether a value is a whole record to the library.
  [[nodiscard]] bool storesOneValue() const;

 private:
  [[nodiscard]] std::size_t count() const { return static_cast<std::size_t>(dimensions); }
};

/// Raises `libraryFailure` ("CDFinquirezVar").
VariableDescription inquireVariable(CdfId file, long variableNumber);

/// The same within another operation, for guards. Returns the status of the inquiry.
long describe(const VariableOperation& variable, VariableDescription& found);

}  // namespace TOLVEX::ambrix
