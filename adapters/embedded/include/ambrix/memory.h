// The memory that host arrays and the module's scratch buffers take.
#pragma once

#include <cstddef>
#include <cstdint>

namespace ambrix {

/// How many arrays and how many of the module's scratch buffers exist in this process. Elements of
/// cell arrays count, too.
struct LiveCounts {
  std::size_t arrays = 0;
  std::size_t scratch = 0;

  friend bool operator==(const LiveCounts&, const LiveCounts&) = default;
};
[[gnu::visibility("default")]] LiveCounts liveCounts() noexcept;

/// The most bytes that the elements of one array, or one scratch buffer, may take; beyond it the
/// error is "TOLVEX:host:outOfMemory". At first there is no limit but the machine's.
[[gnu::visibility("default")]] void setByteLimit(std::size_t bytes) noexcept;
[[gnu::visibility("default")]] std::size_t byteLimit() noexcept;

/// For tests: the n-th allocation from now fails, once, as if memory had run out; 0 takes it back.
/// Small arrays and scratch buffers are one allocation, larger arrays two.
[[gnu::visibility("default")]] void failAllocation(std::uint64_t n) noexcept;
/// Whether the failure asked for is still to come.
[[gnu::visibility("default")]] bool failurePending() noexcept;

}  // namespace ambrix
