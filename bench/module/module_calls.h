// The same work through commands of the module, in the embedded host.
#pragma once

#include <ambrix/embedded.h>

#include <string>
#include <vector>

#include "bench/setup.h"

namespace ambrix_bench {

using ambrix::Array;
using ambrix::ArrayView;
using ambrix::ClassId;

/// The module of this program, loaded once.
ambrix::Module& theModule();

/// Calls a command; the first result, or an empty handle.
Array call(std::string_view command, std::initializer_list<ArrayView> arguments);

inline Array number(double value) {
  return Array::scalar(value);
}
inline Array constant(std::string_view name) {
  return call("getConstantValue", {Array::fromNarrow(name)});
}
Array row(std::span<const double> values);

Array openFile(const Setup& setup, std::string_view name);
inline void closeFile(const Array& file) {
  call("close", {file});
}

/// A hyperslab from the start on, with counts and intervals in the host's order of dimensions.
struct Slab {
  std::size_t records = 1;
  std::vector<double> counts;
  std::vector<double> intervals;
};
Slab wholeSlab(std::size_t records, std::span<const long> sizes);
/// Every second element of each dimension.
Slab everySecond(std::size_t records, std::span<const long> sizes);
Array readSlab(const Array& file, const Slab& slab);

// The workloads, by what they are about.
double readRow(const Setup& setup);
double readColumn(const Setup& setup);
double readGzip(const Setup& setup);
double readGzipFile(const Setup& setup);
double readSmallFiles(const Setup& setup);
double readSmallFilesKeepingMemory(const Setup& setup);
double readWithChecksum(const Setup& setup);
double readText(const Setup& setup);
double readStrided(const Setup& setup);
double readStridedSmallCache(const Setup& setup);

double writeRow(const Setup& setup);
double writeColumn(const Setup& setup);
double writeGzip(const Setup& setup);
double writeWithChecksum(const Setup& setup);
double writeText(const Setup& setup);

double walkMetadata(const Setup& setup);
double walkReadOnly(const Setup& setup);
double walkSmallCache(const Setup& setup);
double openValidated(const Setup& setup);
double openUnvalidated(const Setup& setup);
double writeMetadata(const Setup& setup);

double readSingles(const Setup& setup);
double readHyperSingles(const Setup& setup);
double readRandomGzip(const Setup& setup);
double readRandomGzipBlocks(const Setup& setup);

double breakEpochsDown(const Setup& setup);
double computeEpochs(const Setup& setup);
double breakEpochs16Down(const Setup& setup);
double computeEpochs16(const Setup& setup);

double getConstant(const Setup& setup);
double callUnknown(const Setup& setup);
double refuseArgument(const Setup& setup);
double failInLibrary(const Setup& setup);

double widen(const Setup& setup);
double narrow(const Setup& setup);

}  // namespace ambrix_bench
