// The zlib that the CDF library carries, which this library stands before.
#pragma once

#include "inflate/zlib_abi.h"

namespace ambrix::inflate {

struct LibraryZlib {
  int (*init)(ZStream*, int, const char*, int);
  int (*inflate)(ZStream*, int);
  int (*end)(ZStream*);

  /// Whether all of it is there: a CDF library may have been built with another zlib.
  [[nodiscard]] bool complete() const { return init && inflate && end; }
};

/// The functions that come after those of this library in the order of look-up.
const LibraryZlib& libraryZlib();

/// Whether the CDF library calls `function` where it means its own z_inflate.
bool libraryCalls(int (*function)(ZStream*, int));

}  // namespace ambrix::inflate
