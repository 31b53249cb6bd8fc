// Plain calls of the CDF library, as a C program makes them.
#pragma once

#include <cdf.h>

#include <cstdlib>
#include <memory>
#include <stdexcept>
#include <string>

#include "bench/setup.h"

namespace ambrix_bench {

inline void check(CDFstatus status) {
  if (status >= 0) return;
  char text[256] = {};
  CDFlib(SELECT_, CDF_STATUS_, status, GET_, STATUS_TEXT_, text, NULL_);
  throw std::runtime_error(text);
}

struct Free {
  void operator()(void* memory) const { std::free(memory); }
};
template <typename T>
using Buffer = std::unique_ptr<T[], Free>;

/// Fresh memory from malloc.
template <typename T>
Buffer<T> allocate(std::size_t count) {
  return Buffer<T>(static_cast<T*>(std::malloc(count * sizeof(T))));
}

inline CDFid openFile(const std::string& name) {
  CDFid file = nullptr;
  check(CDFlib(OPEN_, CDF_, name.c_str(), &file, NULL_));
  check(CDFlib(SELECT_, CDF_, file, CDF_zMODE_, zMODEon2, NULL_));
  return file;
}

inline void closeFile(CDFid file) {
  check(CDFlib(SELECT_, CDF_, file, CLOSE_, CDF_, NULL_));
}

/// A new file of this name, in place of an older one.
CDFid createFile(const std::string& name, long majority = ROW_MAJOR);

struct NewVariable {
  const char* name;
  long datatype;
  long elements = 1;
  std::span<const long> sizes = {};
};
long createVariable(CDFid file, const NewVariable& variable);

struct Description {
  char name[CDF_VAR_NAME_LEN256 + 1];
  long datatype, elements, dimensions, recordVariance;
  long sizes[CDF_MAX_DIMS], variances[CDF_MAX_DIMS];
};

/// The inquiry that every command on values begins with.
inline void inquire(CDFid file, long variable, Description& found) {
  check(CDFlib(SELECT_, CDF_, file, zVAR_, variable, GET_,  //
               zVAR_NAME_, found.name,                      //
               zVAR_DATATYPE_, &found.datatype,             //
               zVAR_NUMELEMS_, &found.elements,             //
               zVAR_NUMDIMS_, &found.dimensions,            //
               zVAR_DIMSIZES_, found.sizes,                 //
               zVAR_RECVARY_, &found.recordVariance,        //
               zVAR_DIMVARYS_, found.variances, NULL_));
}

inline long majorityOf(CDFid file) {
  long majority = 0;
  check(CDFlib(SELECT_, CDF_, file, GET_, CDF_MAJORITY_, &majority, NULL_));
  return majority;
}

/// Records from the first, and of each a block of every `interval`-th element.
struct Slab {
  long records = 1;
  long start[CDF_MAX_DIMS] = {};
  long count[CDF_MAX_DIMS] = {};
  long interval[CDF_MAX_DIMS] = {};
  long firstRecord = 0;
};
Slab wholeSlab(std::size_t records, std::span<const long> sizes);

inline void moveSlab(CDFid file, long variable, Slab& slab, long operation, void* data) {
  check(CDFlib(SELECT_, CDF_, file, zVAR_, variable,  //
               zVAR_RECNUMBER_, slab.firstRecord,     //
               zVAR_RECCOUNT_, slab.records,          //
               zVAR_RECINTERVAL_, 1L,                 //
               zVAR_DIMINDICES_, slab.start,          //
               zVAR_DIMCOUNTS_, slab.count,           //
               zVAR_DIMINTERVALS_, slab.interval,     //
               operation, zVAR_HYPERDATA_, data, NULL_));
}

// The workloads, by what they are about.
double prepareFiles(const Setup& setup);

double readRow(const Setup& setup);
double readColumn(const Setup& setup);
double readGzip(const Setup& setup);
double readGzipFile(const Setup& setup);
double readSmallFiles(const Setup& setup);
double writeRow(const Setup& setup);
double writeColumn(const Setup& setup);
double writeGzip(const Setup& setup);
double readText(const Setup& setup);
double writeText(const Setup& setup);
double readStrided(const Setup& setup);
double copyForWidening(const Setup& setup);
double copyForNarrowing(const Setup& setup);

double walkMetadata(const Setup& setup);
double writeMetadata(const Setup& setup);

double readSingles(const Setup& setup);
double readHyperSingles(const Setup& setup);
double failInLibrary(const Setup& setup);

double breakEpochsDown(const Setup& setup);
double computeEpochs(const Setup& setup);
double breakEpochs16Down(const Setup& setup);
double computeEpochs16(const Setup& setup);

}  // namespace ambrix_bench
