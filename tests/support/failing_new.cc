#include "tests/support/failing_new.h"

#include <cstddef>
#include <cstdlib>
#include <new>

namespace ambrix_test {
namespace {

thread_local std::uint64_t allocationsToFailure = 0;  // 0: no failure is asked for

bool failureIsDue() noexcept {
  return allocationsToFailure != 0 && --allocationsToFailure == 0;
}

}  // namespace

void failNew(std::uint64_t n) noexcept {
  allocationsToFailure = n;
}
bool newFailurePending() noexcept {
  return allocationsToFailure != 0;
}

}  // namespace ambrix_test

// Those of arrays and those that do not throw come here, too.
void* operator new(std::size_t bytes) {
  void* const memory = ambrix_test::failureIsDue() ? nullptr : std::malloc(bytes == 0 ? 1 : bytes);
  if (memory == nullptr) throw std::bad_alloc();
  return memory;
}

void operator delete(void* memory) noexcept {
  std::free(memory);
}
void operator delete(void* memory, std::size_t) noexcept {
  std::free(memory);
}
