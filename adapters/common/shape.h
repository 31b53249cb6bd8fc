// The sizes of arrays: every host keeps to the same rules.
#pragma once

#include <cstddef>
#include <span>

namespace ambrix {

/// At least two dimensions: one size n makes n-by-1, none makes 0-by-0. Trailing sizes of 1 beyond
/// the second are dropped.
struct Shape {
  /// The size of a dimension.
  [[nodiscard]] std::size_t operator[](std::size_t dimension) const {
    if (dimension < given.size()) return given[dimension];
    return given.empty() ? 0 : 1;
  }
  /// Raises "TOLVEX:host:outOfMemory" when they cannot be counted.
  [[nodiscard]] std::size_t bytes(std::size_t elementBytes) const;

  std::span<const std::size_t> given;  // without trailing 1s; may be fewer than two
  std::size_t dimensionCount = 0;
  std::size_t elementCount = 0;
};

/// The shape borrows the sizes. Raises "TOLVEX:host:badDimension" for a size that is negative when
/// taken as signed, and "TOLVEX:host:outOfMemory" for more elements than can be counted; one size
/// of 0 makes an empty array, however large the others are.
Shape shapeOf(std::span<const std::size_t> sizes);

}  // namespace ambrix
