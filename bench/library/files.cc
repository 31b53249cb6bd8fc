// The files that are read.
#include <cmath>
#include <cstdint>
#include <filesystem>
#include <vector>

#include "bench/library/plain_calls.h"

namespace ambrix_bench {
namespace {

/// Smooth, with few digits: what instruments deliver, and what compression can do something with.
std::vector<double> measurements(std::size_t count) {
  std::vector<double> values(count);
  for (std::size_t i = 0; i < count; ++i)
    values[i] = std::round(1000 * std::sin(static_cast<double>(i) / 500)) / 8;
  return values;
}

struct Storage {
  long majority = ROW_MAJOR;
  long gzipLevel = 0;
  long fileGzipLevel = 0;
  long blockingFactor = 0;
  long checksum = NO_CHECKSUM;
};

void writeNumbers(const Setup& setup, const char* name, const Storage& storage) {
  std::vector<double> data = measurements(setup.records() * kRecordValues);
  CDFid file = createFile(setup.file(name), storage.majority);
  check(CDFlib(SELECT_, CDF_, file, PUT_, CDF_CHECKSUM_, storage.checksum, NULL_));
  long fileLevel = storage.fileGzipLevel;
  if (fileLevel > 0) {
    check(CDFlib(SELECT_, CDF_, file, PUT_, CDF_COMPRESSION_, GZIP_COMPRESSION, &fileLevel, NULL_));
  }
  const long variable = createVariable(file, {"values", CDF_REAL8, 1, kRecordSizes});
  long level = storage.gzipLevel;
  if (level > 0) {
    check(CDFlib(SELECT_, CDF_, file, zVAR_, variable,  //
                 PUT_, zVAR_COMPRESSION_, GZIP_COMPRESSION, &level, NULL_));
  }
  Slab slab = wholeSlab(setup.records(), kRecordSizes);
  moveSlab(file, variable, slab, PUT_, data.data());
  closeFile(file);
}

/// One double a record.
void writeSeries(const Setup& setup, const char* name, const Storage& storage) {
  std::vector<double> data = measurements(setup.singles());
  CDFid file = createFile(setup.file(name));
  const long variable = createVariable(file, {"series", CDF_REAL8});
  long level = storage.gzipLevel;
  if (level > 0) {
    check(CDFlib(SELECT_, CDF_, file, zVAR_, variable,  //
                 PUT_, zVAR_COMPRESSION_, GZIP_COMPRESSION, &level, NULL_));
  }
  if (storage.blockingFactor > 0) {
    check(CDFlib(SELECT_, CDF_, file, zVAR_, variable,  //
                 PUT_, zVAR_BLOCKINGFACTOR_, storage.blockingFactor, NULL_));
  }
  Slab slab = wholeSlab(setup.singles(), {});
  moveSlab(file, variable, slab, PUT_, data.data());
  closeFile(file);
}

/// A hundred doubles in a compressed file.
void writeSmall(const Setup& setup) {
  std::vector<double> data = measurements(100);
  CDFid file = createFile(setup.file("small_gzip"));
  long level = 6;
  check(CDFlib(SELECT_, CDF_, file, PUT_, CDF_COMPRESSION_, GZIP_COMPRESSION, &level, NULL_));
  const long variable = createVariable(file, {"series", CDF_REAL8});
  Slab slab = wholeSlab(data.size(), {});
  moveSlab(file, variable, slab, PUT_, data.data());
  closeFile(file);
}

void writeTexts(const Setup& setup) {
  std::vector<char> data(setup.texts() * kTextLength + 1, 'a');
  data.back() = '\0';
  CDFid file = createFile(setup.file("text"));
  const long variable = createVariable(file, {"text", CDF_CHAR, kTextLength});
  Slab slab = wholeSlab(setup.texts(), {});
  moveSlab(file, variable, slab, PUT_, data.data());
  closeFile(file);
}

void writeImages(const Setup& setup) {
  std::vector<std::int16_t> data(setup.images() * 4096, 7);
  CDFid file = createFile(setup.file("image"));
  const long variable = createVariable(file, {"image", CDF_INT2, 1, kImageSizes});
  Slab slab = wholeSlab(setup.images(), kImageSizes);
  moveSlab(file, variable, slab, PUT_, data.data());
  closeFile(file);
}

}  // namespace

double prepareFiles(const Setup& setup) {
  const Stopwatch watch;
  writeNumbers(setup, "row", {});
  writeNumbers(setup, "column", {.majority = COLUMN_MAJOR});
  writeNumbers(setup, "gzip", {.gzipLevel = 6});
  writeNumbers(setup, "gzip_file", {.fileGzipLevel = 6});
  writeNumbers(setup, "checksum", {.checksum = MD5_CHECKSUM});
  writeSeries(setup, "series", {});
  writeSeries(setup, "series_gzip", {.gzipLevel = 6});
  writeSeries(setup, "series_gzip_100", {.gzipLevel = 6, .blockingFactor = 100});
  writeSmall(setup);
  writeTexts(setup);
  writeImages(setup);
  writeMetadata(setup);
  std::filesystem::rename(setup.file("library_written.cdf"), setup.file("metadata.cdf"));
  return watch.seconds();
}

}  // namespace ambrix_bench
