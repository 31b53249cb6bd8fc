// A strided block of records and, within each record, a strided block of each dimension.
#pragma once

#include <span>
#include <vector>

#include "gateway/library_calls.h"
#include "host/qv.h"
#include "variables/host_dimensions.h"
#include "variables/variable_description.h"

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

/// The records of one read or write, as the library takes them.
struct RecordRange {
  long first;
  long count;
  long interval;

  /// Of counts or intervals that the library refuses, the first one.
  [[nodiscard]] long last() const {
    return count < 1 || interval < 1 ? first : first + (count - 1) * interval;
  }
};

/// A hyperslab as the library reads it, in a variable of these dimension sizes. The library
/// computes its last record and indices in 32 bits, where they can wrap around into the variable:
/// such a hyperslab becomes one that starts beyond it, which the library refuses.
struct LibraryHyperslab {
  LibraryHyperslab(const Hyperslab& slab, std::span<const long> sizes);

  long recordStart;
  long recordCount;
  long recordInterval;
  DimensionVector start;
  DimensionVector count;
  DimensionVector interval;

  [[nodiscard]] RecordRange records() const { return {recordStart, recordCount, recordInterval}; }
  [[nodiscard]] long lastRecord() const { return records().last(); }
};

/// Whether the library moves each record of the hyperslab in one piece.
bool takesWholeRecords(const VariableDescription& description, const LibraryHyperslab& slab);

/// Guard: of a variable whose records do not vary every version of the library reads whole records
/// with all those between them, more than were asked for. Only one is stored, so none need be
/// skipped.
void readSameRecordWithoutSkipping(const VariableDescription& description, LibraryHyperslab& slab);

/// Selects the variable and the hyperslab.
void selectHyperslab(const VariableOperation& variable, const LibraryHyperslab& slab);

/// The same, then performs GET_ or PUT_ of `zVAR_HYPERDATA_`. Returns the status.
long moveHyperslab(const VariableOperation& variable, const LibraryHyperslab& slab, long operation,
                   const void* values);

}  // namespace TOLVEX::ambrix
