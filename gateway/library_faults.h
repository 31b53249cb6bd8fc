// Faults that some versions of the CDF library have and others have not. A guard against one of
// them acts only where the running library has it: elsewhere the answer is the library's own.
#pragma once

#include <compare>

namespace TOLVEX::ambrix {

struct LibraryVersion {
  long version = 0;
  long release = 0;
  long increment = 0;
  friend auto operator<=>(const LibraryVersion&, const LibraryVersion&) = default;
};

// The versions that were tried. One between them counts as having the faults of both.
inline constexpr LibraryVersion kOldestTried{3, 6, 3};
inline constexpr LibraryVersion kNewestTried{3, 9, 1};

struct LibraryFaults {
  /// Fills a result with the memory before it when it reads a record that does not vary and was
  /// never written, in a file of the format of version 2. In 3.6.3, not in 3.9.1.
  bool leavesUnwrittenRecords = false;
  /// Frees an attribute twice that was selected before read-only mode was turned on, when it looks
  /// for the fill value of a missing record. In 3.9.1, not in 3.6.3.
  bool freesSelectedAttributeTwice = false;
};

constexpr LibraryFaults faultsOf(const LibraryVersion& library) {
  LibraryFaults faults;
  faults.leavesUnwrittenRecords = library < kNewestTried;
  faults.freesSelectedAttributeTwice = library > kOldestTried;
  return faults;
}

/// Those of the running library, which is asked for its version once. Tests change them.
LibraryFaults& libraryFaults();

}  // namespace TOLVEX::ambrix
