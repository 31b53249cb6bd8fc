// Much data in one call.
#include <cstdint>
#include <cstring>
#include <filesystem>
#include <numeric>
#include <vector>

#include "bench/library/plain_calls.h"

namespace ambrix_bench {
namespace {

/// Opens, inquires, reads into fresh memory, frees it and closes.
template <typename T>
double readSlab(const std::string& name, Slab slab, std::size_t values) {
  const Stopwatch watch;
  CDFid file = openFile(name);
  Description description;
  inquire(file, 0L, description);
  majorityOf(file);
  {
    const Buffer<T> data = allocate<T>(values);
    moveSlab(file, 0L, slab, GET_, data.get());
  }
  closeFile(file);
  return watch.seconds();
}

double readNumbers(const Setup& setup, const char* name) {
  return readSlab<double>(setup.file(name), wholeSlab(setup.records(), kRecordSizes),
                          setup.records() * kRecordValues);
}

/// Inquires as the command does, writes and closes.
void putAndClose(CDFid file, long variable, Slab& slab, void* data) {
  Description description;
  inquire(file, variable, description);
  majorityOf(file);
  moveSlab(file, variable, slab, PUT_, data);
  closeFile(file);
}

double writeNumbers(const Setup& setup, long majority, bool compressed) {
  const std::size_t values = setup.records() * kRecordValues;
  std::vector<double> data(values);
  std::iota(data.begin(), data.end(), 0.0);
  const std::string name = setup.file("library_written");
  Slab slab = wholeSlab(setup.records(), kRecordSizes);
  std::filesystem::remove(name + ".cdf");
  const Stopwatch watch;
  CDFid file = createFile(name, majority);
  const long variable = createVariable(file, {"values", CDF_REAL8, 1, kRecordSizes});
  long level = 6;
  if (compressed) {
    check(CDFlib(SELECT_, CDF_, file, zVAR_, variable,  //
                 PUT_, zVAR_COMPRESSION_, GZIP_COMPRESSION, &level, NULL_));
  }
  putAndClose(file, variable, slab, data.data());
  return watch.seconds();
}

/// memcpy of as many bytes as a conversion between bytes and 16 bits reads and writes: half of the
/// three for each character.
double copySameTraffic(const Setup& setup) {
  const std::size_t bytes = setup.times() * 3 / 2;
  const std::vector<char> from(bytes, 'a');
  std::vector<char> to(bytes);
  const Stopwatch watch;
  for (int i = 0; i < 20; ++i) {
    std::memcpy(to.data(), from.data(), bytes);
    asm volatile("" : : "r"(to.data()) : "memory");  // the copies are wanted
  }
  return watch.seconds();
}

}  // namespace

double readRow(const Setup& setup) {
  return readNumbers(setup, "row.cdf");
}
double readColumn(const Setup& setup) {
  return readNumbers(setup, "column.cdf");
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
    seconds += readSlab<double>(setup.file("small_gzip.cdf"), wholeSlab(100, {}), 100);
  return seconds;
}

double writeRow(const Setup& setup) {
  return writeNumbers(setup, ROW_MAJOR, false);
}
double writeColumn(const Setup& setup) {
  return writeNumbers(setup, COLUMN_MAJOR, false);
}
double writeGzip(const Setup& setup) {
  return writeNumbers(setup, ROW_MAJOR, true);
}

double readText(const Setup& setup) {
  return readSlab<char>(setup.file("text.cdf"), wholeSlab(setup.texts(), {}),
                        setup.texts() * kTextLength + 1);
}

double writeText(const Setup& setup) {
  std::vector<char> data(setup.texts() * kTextLength + 1, 'a');
  data.back() = '\0';
  const std::string name = setup.file("library_written");
  Slab slab = wholeSlab(setup.texts(), {});
  std::filesystem::remove(name + ".cdf");
  const Stopwatch watch;
  CDFid file = createFile(name);
  const long variable = createVariable(file, {"text", CDF_CHAR, kTextLength});
  putAndClose(file, variable, slab, data.data());
  return watch.seconds();
}

double readStrided(const Setup& setup) {
  Slab slab = wholeSlab(setup.images(), kImageSizes);
  for (std::size_t i = 0; i < std::size(kImageSizes); ++i) {
    slab.count[i] = kImageSizes[i] / 2;
    slab.interval[i] = 2;
  }
  return readSlab<std::int16_t>(setup.file("image.cdf"), slab, setup.images() * kImageValuesRead);
}

double copyForWidening(const Setup& setup) {
  return copySameTraffic(setup);
}
double copyForNarrowing(const Setup& setup) {
  return copySameTraffic(setup);
}

}  // namespace ambrix_bench
