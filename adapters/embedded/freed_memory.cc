#include <cstdlib>

#ifdef __GLIBC__
#include <malloc.h>
#endif

#include "ambrix/memory.h"

namespace ambrix {

// To set one of these ends the adjustments that the C library makes to the others.
bool keepFreedMemory() noexcept {
#ifdef __GLIBC__
  constexpr int kMiB = 1 << 20;
  return mallopt(M_TRIM_THRESHOLD, 16 * kMiB) == 1 && mallopt(M_TOP_PAD, 2 * kMiB) == 1 &&
         mallopt(M_MMAP_THRESHOLD, 4 * kMiB) == 1;
#else
  return false;
#endif
}

}  // namespace ambrix
