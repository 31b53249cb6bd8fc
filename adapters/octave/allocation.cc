// Where the module's temporary buffers come from.
#include <cstdlib>

#include "adapters/common/host_errors.h"
#include "adapters/common/scratch.h"

void* ambrix::allocateScratch(std::size_t headBytes, std::size_t bytes) {
  void* const block = std::malloc(headBytes + bytes);
  if (block == nullptr) raiseOutOfMemory();
  return block;
}

void ambrix::releaseScratch(void* memory) noexcept {
  std::free(memory);
}
