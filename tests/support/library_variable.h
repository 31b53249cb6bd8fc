// A variable as the CDF library knows it, and how many bytes it moves for it: by its own
// description of the variable, whether that makes sense or not.
#pragma once

#include <array>
#include <cstddef>
#include <optional>

namespace ambrix_test {

inline constexpr std::size_t kLibraryDimensions = 10;
using Slots = std::array<long, kLibraryDimensions>;

struct LibraryVariable {
  long datatype = 22;
  long elements = 1;
  long dimensions = 0;
  Slots sizes{};
  long recordVariance = -1;
  Slots variances{};
  long majority = 2;
};

/// The hyperslab that a call has selected.
struct LibrarySelection {
  long recordCount = 1;
  long recordInterval = 1;
  Slots start{};
  Slots count{};
  Slots interval{};
};

/// 0 for a negative number, none for one beyond counting.
std::optional<std::size_t> bytesOf(const LibraryVariable& variable, long values);

/// Along a dimension that does not vary, one value is stored.
long valuesOfRecord(const LibraryVariable& variable);

/// 0 for a hyperslab that the library refuses.
long valuesWritten(const LibrarySelection& slab, const LibraryVariable& variable);
/// Of a variable whose records do not vary it reads whole records with all those between them.
long valuesRead(const LibrarySelection& slab, const LibraryVariable& variable);

}  // namespace ambrix_test
