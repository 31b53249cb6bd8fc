#include "adapters/embedded/allocation.h"

#include <atomic>
#include <cstdint>
#include <cstdlib>
#include <limits>

#include "adapters/common/host_errors.h"
#include "adapters/common/large_pages.h"
#include "adapters/common/scratch.h"
#include "ambrix/memory.h"

namespace ambrix {
namespace {

std::atomic<std::size_t> limit = std::numeric_limits<std::size_t>::max();
std::atomic<std::uint64_t> allocationsToFailure = 0;  // 0: no failure is asked for
std::atomic<std::ptrdiff_t> liveArrays = 0;
std::atomic<std::ptrdiff_t> liveScratch = 0;

constexpr auto kRelaxed = std::memory_order_relaxed;

/// Whether this allocation is the one that a test wants to fail.
bool failureIsDue() {
  if (allocationsToFailure.load(kRelaxed) == 0) return false;
  return allocationsToFailure.fetch_sub(1, kRelaxed) == 1;
}

void* orRaise(void* memory) {
  if (memory == nullptr) raiseOutOfMemory();
  return memory;
}

std::size_t atLeastOne(std::size_t bytes) {
  return bytes == 0 ? 1 : bytes;
}

/// Memory that can have large pages begins where one can, so that all but its end lies in them.
void* allocateUnset(std::size_t bytes) {
  if (bytes < kLargePage || bytes > PTRDIFF_MAX - kLargePage) return std::malloc(atLeastOne(bytes));
  void* memory = nullptr;
  if (posix_memalign(&memory, kLargePage, bytes) != 0) return nullptr;
  preferLargePages(memory, bytes);
  return memory;
}

}  // namespace

void requireWithinLimit(std::size_t bytes) {
  if (bytes > limit.load(kRelaxed)) raiseOutOfMemory();
}

void* allocate(std::size_t bytes) {
  return orRaise(failureIsDue() ? nullptr : allocateUnset(bytes));
}

void* allocateZeroed(std::size_t bytes) {
  return orRaise(failureIsDue() ? nullptr : std::calloc(atLeastOne(bytes), 1));
}

void release(void* memory) noexcept {
  std::free(memory);
}

void* allocateScratch(std::size_t headBytes, std::size_t bytes) {
  requireWithinLimit(bytes);
  void* const block = allocate(headBytes + bytes);
  liveScratch.fetch_add(1, kRelaxed);
  return block;
}

void releaseScratch(void* memory) noexcept {
  release(memory);
  liveScratch.fetch_sub(1, kRelaxed);
}

void countArray(int change) noexcept {
  liveArrays.fetch_add(change, kRelaxed);
}

LiveCounts liveCounts() noexcept {
  return {static_cast<std::size_t>(liveArrays.load(kRelaxed)),
          static_cast<std::size_t>(liveScratch.load(kRelaxed))};
}

void setByteLimit(std::size_t bytes) noexcept {
  limit.store(bytes, kRelaxed);
}
std::size_t byteLimit() noexcept {
  return limit.load(kRelaxed);
}

void failAllocation(std::uint64_t n) noexcept {
  allocationsToFailure.store(n, kRelaxed);
}
bool failurePending() noexcept {
  return allocationsToFailure.load(kRelaxed) != 0;
}

}  // namespace ambrix
