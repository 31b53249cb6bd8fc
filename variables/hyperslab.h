// A strided block of records and, within each record, a strided block of each dimension.
#pragma once

#include <vector>

#include "gateway/library.h"
#include "host/qv.h"
#include "variables/host_dimensions.h"

namespace TOLVEX::ambrix {

/// As the user gives it: per-dimension numbers in the host's order until they are reversed for a
/// row-major file.
struct Hyperslab {
  long recordStart = 0;
  long recordCount = 0;
  long recordInterval = 0;
  std::vector<long> start;
  std::vector<long> count;
  std::vector<long> interval;

  void reverseDimensions();
};

/// Converts six arguments from "RECSTART" on. The label of the interval vector is the caller's.
Hyperslab getHyperslabArgs(const qvArray* arguments[], const char* intervalLabel);

/// A hyperslab as the library reads it.
struct LibraryHyperslab {
  explicit LibraryHyperslab(const Hyperslab& slab);

  long recordStart;
  long recordCount;
  long recordInterval;
  DimensionVector start;
  DimensionVector count;
  DimensionVector interval;
};

/// Selects the variable and the hyperslab, then performs GET_ or PUT_ of `zVAR_HYPERDATA_`.
void moveHyperslab(const char* routine, CdfId file, long variable, LibraryHyperslab slab,
                   long operation, const void* buffer);

}  // namespace TOLVEX::ambrix
