#include "variables/hyperslab.h"

#include <algorithm>

#include "gateway/arguments.h"

namespace TOLVEX::ambrix {

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

LibraryHyperslab::LibraryHyperslab(const Hyperslab& slab)
    : recordStart(libraryNumber(slab.recordStart, kBadNumber)),
      recordCount(libraryNumber(slab.recordCount, kBadNumber)),
      recordInterval(libraryNumber(slab.recordInterval, kBadNumber)),
      start(libraryVector(slab.start, kBadNumber)),
      count(libraryVector(slab.count, kBadNumber)),
      interval(libraryVector(slab.interval, kBadNumber)) {}

void moveHyperslab(const char* routine, CdfId file, long variable, LibraryHyperslab slab,
                   long operation, const void* buffer) {
  callOnVariable(routine, file, variable,                                                      //
                 zVAR_RECNUMBER_, slab.recordStart,                                            //
                 zVAR_RECCOUNT_, slab.recordCount,                                             //
                 zVAR_RECINTERVAL_, slab.recordInterval, zVAR_DIMINDICES_, slab.start.data(),  //
                 zVAR_DIMCOUNTS_, slab.count.data(),                                           //
                 zVAR_DIMINTERVALS_, slab.interval.data(), operation, zVAR_HYPERDATA_, buffer);
}

}  // namespace TOLVEX::ambrix
