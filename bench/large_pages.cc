// From how many bytes on new memory is filled faster in large pages: CPU time with them as a ratio
// to that without, the median of many rounds. "aligned" memory begins where a large page can, as
// the embedded host has it; the other begins anywhere, as in Octave.
#include "adapters/common/large_pages.h"

#include <malloc.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <ctime>
#include <vector>

namespace {

constexpr int kRounds = 201;

double seconds() {
  std::timespec now{};
  clock_gettime(CLOCK_PROCESS_CPUTIME_ID, &now);
  return static_cast<double>(now.tv_sec) + static_cast<double>(now.tv_nsec) * 1e-9;
}

/// The time to get memory, to write it once, and to return it.
double timeToFill(std::size_t bytes, std::size_t alignment, bool inLargePages) {
  const double start = seconds();
  void* memory = nullptr;
  if (posix_memalign(&memory, alignment, bytes) != 0) std::abort();
  if (inLargePages) ambrix::preferLargePages(memory, bytes);
  std::memset(memory, 1, bytes);
  asm volatile("" : : "r"(memory) : "memory");  // else nothing is written that nobody reads
  std::free(memory);
  return seconds() - start;
}

double medianRatio(std::size_t bytes, std::size_t alignment) {
  std::vector<double> ratios;
  for (int round = 0; round < kRounds; ++round) {
    const double small = timeToFill(bytes, 16, false);
    ratios.push_back(timeToFill(bytes, alignment, true) / small);
  }
  std::ranges::sort(ratios);
  return ratios[kRounds / 2];
}

}  // namespace

int main() {
  mallopt(M_MMAP_THRESHOLD, 1 << 17);  // what was freed would else be used again, with its pages
  std::puts("     KiB   aligned  anywhere");
  for (const std::size_t kib : {1024U, 2048U, 3072U, 4096U, 6144U, 8192U, 16384U, 32768U}) {
    const std::size_t bytes = kib << 10U;
    const double aligned = medianRatio(bytes, ambrix::kLargePage);
    std::printf("%8zu %9.2f %9.2f\n", kib, aligned, medianRatio(bytes, 16));
  }
}
