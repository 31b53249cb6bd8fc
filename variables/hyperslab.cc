#include "variables/hyperslab.h"

#include <algorithm>
#include <cstddef>

#include "gateway/arguments.h"

namespace TOLVEX::ambrix {
namespace {

/// Whether the last of `count` numbers, `interval` apart, is beyond 32 bits. Each of the three is
/// within them, so 64 bits hold the result.
bool wraps(long start, long count, long interval) {
  return start >= 0 && count >= 1 && interval >= 1 && !fitsLibrary(start + (count - 1) * interval);
}

template <typename... Items>
long callOnHyperslab(const VariableOperation& variable, const LibraryHyperslab& slab,
                     Items... items) {
  return variable.status(zVAR_RECNUMBER_, slab.recordStart,         //
                         zVAR_RECCOUNT_, slab.recordCount,          //
                         zVAR_RECINTERVAL_, slab.recordInterval,    //
                         zVAR_DIMINDICES_, slab.start.data(),       //
                         zVAR_DIMCOUNTS_, slab.count.data(),        //
                         zVAR_DIMINTERVALS_, slab.interval.data(),  //
                         items...);
}

}  // namespace

void Hyperslab::reverseDimensions() {
  std::ranges::reverse(start);
  std::ranges::reverse(count);
  std::ranges::reverse(interval);
}

Hyperslab getHyperslabArgs(const qvArray* arguments[], const char* intervalLabel) {
  Hyperslab slab;
  slab.recordStart = getLongScalarArg(arguments[0], "RECSTART");
  slab.recordCount = getLongScalarArg(arguments[1], "RECCOUNT");
  slab.recordInterval = getLongScalarArg(arguments[2], "RECSTRIDE");
  slab.start = getLongVectorArg(arguments[3], "DIMSTART");
  slab.count = getLongVectorArg(arguments[4], "DIMCOUNT");
  slab.interval = getLongVectorArg(arguments[5], intervalLabel);
  return slab;
}

LibraryHyperslab::LibraryHyperslab(const Hyperslab& slab, std::span<const long> sizes)
    : recordStart(libraryNumber(slab.recordStart, kBadNumber)),
      recordCount(libraryNumber(slab.recordCount, kBadNumber)),
      recordInterval(libraryNumber(slab.recordInterval, kBadNumber)),
      start(libraryVector(slab.start, kBadNumber)),
      count(libraryVector(slab.count, kBadNumber)),
      interval(libraryVector(slab.interval, kBadNumber)) {
  if (wraps(recordStart, recordCount, recordInterval)) recordStart = kBadNumber;
  for (std::size_t i = 0; i < sizes.size(); ++i) {
    if (!wraps(start[i], count[i], interval[i])) continue;
    start[i] = sizes[i];
    interval[i] = 1;
  }
}

bool takesWholeRecords(const VariableDescription& description, const LibraryHyperslab& slab) {
  for (std::size_t i = 0; i < description.sizes().size(); ++i) {
    const bool varies = description.variances()[i] != NOVARY;
    const bool whole = varies ? slab.count[i] == description.sizes()[i] : slab.count[i] <= 1;
    if (!whole) return false;
  }
  return true;
}

void readSameRecordWithoutSkipping(const VariableDescription& description, LibraryHyperslab& slab) {
  const bool skips = slab.recordCount > 1 && slab.recordInterval > 1;
  if (description.recordVariance == NOVARY && skips && takesWholeRecords(description, slab)) {
    slab.recordInterval = 1;
  }
}

void selectHyperslab(const VariableOperation& variable, const LibraryHyperslab& slab) {
  variable.check(callOnHyperslab(variable, slab));
}

long moveHyperslab(const VariableOperation& variable, const LibraryHyperslab& slab, long operation,
                   const void* values) {
  return callOnHyperslab(variable, slab, operation, zVAR_HYPERDATA_, values);
}

}  // namespace TOLVEX::ambrix
