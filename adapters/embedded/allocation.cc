#include "adapters/embedded/allocation.h"

#include <atomic>
#include <cstdint>
#include <cstdlib>
#include <limits>
#ifdef __linux__
#include <sys/mman.h>
#endif

#include "adapters/embedded/host_errors.h"
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

#ifdef __linux__
// Reading into new memory is mostly a matter of the system providing it, page by page. Pages of
// 2 MiB cost a small fraction; the system gives them where it is asked to and can. What reaches
// beyond the last whole one is left in small pages, so that no more is used than was asked for.
constexpr std::size_t kHugePage = std::size_t{2} << 20U;
constexpr std::size_t kManyBytes = 2 * kHugePage;

void* allocateUnset(std::size_t bytes) {
  if (bytes < kManyBytes || bytes > PTRDIFF_MAX - kHugePage) return std::malloc(atLeastOne(bytes));
  void* memory = nullptr;
  if (posix_memalign(&memory, kHugePage, bytes) != 0) return nullptr;
  madvise(memory, bytes / kHugePage * kHugePage, MADV_HUGEPAGE);  // a hint: failing is no matter
  return memory;
}
#else
void* allocateUnset(std::size_t bytes) {
  return std::malloc(atLeastOne(bytes));
}
#endif

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

void countArray(int change) noexcept {
  liveArrays.fetch_add(change, kRelaxed);
}
void countScratch(int change) noexcept {
  liveScratch.fetch_add(change, kRelaxed);
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
