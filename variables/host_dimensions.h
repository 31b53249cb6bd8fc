// How the dimensions of a variable become the dimensions of a host array: pure shape arithmetic.
#pragma once

#include <array>
#include <cstddef>
#include <span>
#include <vector>

#include "variables/variable_description.h"

namespace TOLVEX::ambrix {

/// Sizes as the host takes them. A negative size stays recognisable as one.
class HostDimensions {
 public:
  void append(long size) { sizes_[count_++] = static_cast<std::size_t>(size); }
  /// Reverses the entries from the `first` to the one before the `last`, that one excluded.
  void reverse(std::size_t first, std::size_t last);

  [[nodiscard]] std::size_t count() const { return count_; }
  [[nodiscard]] const std::size_t* data() const { return sizes_.data(); }

 private:
  // A leading dimension, those of the variable and the records.
  std::array<std::size_t, CDF_MAX_DIMS + 2> sizes_{};
  std::size_t count_ = 0;
};

/// One value: a column of 2 doubles for `CDF_EPOCH16`, of its characters for text, else 1-by-1.
HostDimensions valueDimensions(const VariableDescription& description);

/// One record: the leading dimension, if any, and all dimension sizes in the host's order.
HostDimensions recordDimensions(const VariableDescription& description, bool rowMajor);

/// A hyperslab: the leading dimension, if any, the counts (given in the library's order) in the
/// host's order, and the number of records. Raises `dimSizeTooLarge` if a count exceeds its
/// dimension.
HostDimensions hyperslabDimensions(const VariableDescription& description,
                                   std::span<const long> counts, long records);
/// Puts the counts of a hyperslab of a row-major file into the host's order.
void reverseCounts(HostDimensions& dimensions, std::size_t counts);

/// Per-dimension numbers for the library: exactly as many entries as it may read, zero where the
/// user gave none.
using DimensionVector = std::array<long, CDF_MAX_DIMS>;

/// Numbers beyond 32 bits become `refused`.
DimensionVector libraryVector(std::span<const long> values, long refused);

}  // namespace TOLVEX::ambrix
