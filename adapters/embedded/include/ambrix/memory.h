// The memory that host arrays and the module's scratch buffers take.
#pragma once

#include <cstddef>
#include <cstdint>

#include "ambrix/export.h"

namespace ambrix {

/// How many arrays and how many of the module's scratch buffers exist in this process. Elements of
/// cell arrays count, too.
struct LiveCounts {
  std::size_t arrays = 0;
  std::size_t scratch = 0;

  friend bool operator==(const LiveCounts&, const LiveCounts&) = default;
};
AMBRIX_EXPORT LiveCounts liveCounts() noexcept;

/// The most bytes that the elements of one array, or one scratch buffer, may take; beyond it the
/// error is "TOLVEX:host:outOfMemory". At first there is no limit but the machine's.
AMBRIX_EXPORT void setByteLimit(std::size_t bytes) noexcept;
AMBRIX_EXPORT std::size_t byteLimit() noexcept;

/// For tests: the n-th allocation from now fails, once, as if memory had run out; 0 takes it back.
/// Small arrays, arrays over borrowed memory and scratch buffers are one allocation, larger arrays
/// two.
AMBRIX_EXPORT void failAllocation(std::uint64_t n) noexcept;
/// Whether the failure asked for is still to come.
AMBRIX_EXPORT bool failurePending() noexcept;

}  // namespace ambrix
