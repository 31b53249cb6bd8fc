#include "adapters/octave/fresh_array.h"

#include <cstdint>

#if __has_include(<sys/mman.h>)
#include <sys/mman.h>
#endif

namespace ambrix::octave_host {

void preferLargePages([[maybe_unused]] void* memory, [[maybe_unused]] std::size_t bytes) noexcept {
#ifdef MADV_HUGEPAGE
  constexpr std::size_t kLargePage = std::size_t{1} << 21;
  if (bytes < 4 * kLargePage) return;
  const auto start = reinterpret_cast<std::uintptr_t>(memory);
  const std::uintptr_t first = (start + kLargePage - 1) / kLargePage * kLargePage;
  const std::uintptr_t end = (start + bytes) / kLargePage * kLargePage;
  // Only advice: it is all the same if the system takes none.
  madvise(reinterpret_cast<void*>(first), end - first, MADV_HUGEPAGE);
#endif
}

}  // namespace ambrix::octave_host
