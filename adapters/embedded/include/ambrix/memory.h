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

/// Has this process keep up to 16 MiB of what it frees, for good. By default the C library gives
/// memory back to the system when a compressed file is closed, and takes as much again for the next
/// one. Returns false where the C library knows no such setting.
AMBRIX_EXPORT bool keepFreedMemory() noexcept;

/// For tests: the n-th allocation from now fails, once, as if memory had run out; 0 takes it back.
/// Small arrays, arrays over borrowed memory and scratch buffers are one allocation, larger arrays
/// two.
AMBRIX_EXPORT void failAllocation(std::uint64_t n) noexcept;
/// Whether the failure asked for is still to come.
AMBRIX_EXPORT bool failurePending() noexcept;

}  // namespace ambrix
