// Much data in one call, to be read.
#include "bench/module/module_calls.h"

namespace ambrix_bench {
namespace {

/// Opens, reads, frees what was read and closes.
double read(const Setup& setup, const char* name, const Slab& slab) {
  const Stopwatch watch;
  const Array file = openFile(setup, name);
  readSlab(file, slab);
  closeFile(file);
  return watch.seconds();
}

double readNumbers(const Setup& setup, const char* name) {
  return read(setup, name, wholeSlab(setup.records(), kRecordSizes));
}

}  // namespace

double readRow(const Setup& setup) {
  return readNumbers(setup, "row.cdf");
}
double readColumn(const Setup& setup) {
  Slab slab = wholeSlab(setup.records(), kRecordSizes);
  slab.counts.assign(std::begin(kRecordSizes), std::end(kRecordSizes));
  return read(setup, "column.cdf", slab);
}
double readGzip(const Setup& setup) {
  return readNumbers(setup, "gzip.cdf");
}
double readGzipFile(const Setup& setup) {
  return readNumbers(setup, "gzip_file.cdf");
}
double readSmallFiles(const Setup& setup) {
  double seconds = 0;
  for (std::size_t i = 0; i < setup.smallFiles(); ++i)
    seconds += read(setup, "small_gzip.cdf", wholeSlab(100, {}));
  return seconds;
}
double readSmallFilesKeepingMemory(const Setup& setup) {
  ambrix::keepFreedMemory();
  return readSmallFiles(setup);
}
double readWithChecksum(const Setup& setup) {
  return readNumbers(setup, "checksum.cdf");
}

double readText(const Setup& setup) {
  return read(setup, "text.cdf", wholeSlab(setup.texts(), {}));
}

double readStrided(const Setup& setup) {
  return read(setup, "image.cdf", everySecond(setup.images(), kImageSizes));
}

double readStridedSmallCache(const Setup& setup) {
  const Slab slab = everySecond(setup.images(), kImageSizes);
  const Stopwatch watch;
  const Array file = openFile(setup, "image.cdf");
  call("setCacheSize", {file, number(2)});
  readSlab(file, slab);
  closeFile(file);
  return watch.seconds();
}

}  // namespace ambrix_bench
