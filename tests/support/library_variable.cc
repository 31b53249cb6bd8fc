#include "tests/support/library_variable.h"

#include <algorithm>

#include "tests/support/datatypes.h"

namespace ambrix_test {
namespace {

std::size_t dimensionsOf(const LibraryVariable& variable) {
  return static_cast<std::size_t>(std::clamp(variable.dimensions, 0L, long{kLibraryDimensions}));
}

bool takesWholeRecords(const LibrarySelection& slab, const LibraryVariable& variable) {
  for (std::size_t i = 0; i < dimensionsOf(variable); ++i) {
    if (slab.count[i] != (variable.variances[i] == 0 ? 1 : variable.sizes[i])) return false;
  }
  return true;
}

}  // namespace

std::optional<std::size_t> bytesOf(const LibraryVariable& variable, long values) {
  const auto size = static_cast<long>(libraryBytes(variable.datatype));
  long bytes = 0;
  const bool wraps = __builtin_mul_overflow(values, variable.elements, &bytes) ||
                     __builtin_mul_overflow(bytes, size, &bytes);
  if (wraps) return std::nullopt;
  return static_cast<std::size_t>(std::max(bytes, 0L));
}

long valuesOfRecord(const LibraryVariable& variable) {
  long values = 1;
  for (std::size_t i = 0; i < dimensionsOf(variable); ++i) {
    if (variable.variances[i] != 0) values *= variable.sizes[i];
  }
  return values;
}

long valuesWritten(const LibrarySelection& slab, const LibraryVariable& variable) {
  long values = std::max(slab.recordCount, 0L);
  for (std::size_t i = 0; i < dimensionsOf(variable); ++i) {
    const bool sound = slab.count[i] >= 1 && slab.interval[i] >= 1 && slab.start[i] >= 0;
    const long last = slab.start[i] + (slab.count[i] - 1) * slab.interval[i];
    if (!sound || last >= variable.sizes[i]) return 0;
    if (__builtin_mul_overflow(values, slab.count[i], &values)) return 0;
  }
  return values;
}

long valuesRead(const LibrarySelection& slab, const LibraryVariable& variable) {
  const long values = valuesWritten(slab, variable);
  const bool between = variable.recordVariance == 0 && takesWholeRecords(slab, variable);
  if (!between || values == 0) return values;
  return values / slab.recordCount * (slab.recordInterval * (slab.recordCount - 1) + 1);
}

}  // namespace ambrix_test
