// Values read one by one, times converted one by one.
#include <algorithm>
#include <vector>

#include "bench/library/plain_calls.h"

namespace ambrix_bench {

namespace {

/// Reads one value of each record, inquiring before each as a command does.
template <typename Read>
double timeSingles(const Setup& setup, const Read& read) {
  CDFid file = openFile(setup.file("series.cdf"));
  double sum = 0;
  const Stopwatch watch;
  for (long record = 0; record < static_cast<long>(setup.singles()); ++record) {
    Description description;
    inquire(file, 0L, description);
    majorityOf(file);
    double value = 0;
    read(file, record, &value);
    sum += value;
  }
  const double seconds = watch.seconds();
  closeFile(file);
  return sum == 0 ? 0 : seconds;
}

}  // namespace

double readSingles(const Setup& setup) {
  long indices[CDF_MAX_DIMS] = {};
  return timeSingles(setup, [&](CDFid file, long record, double* value) {
    check(CDFlib(SELECT_, CDF_, file, zVAR_, 0L,  //
                 zVAR_RECNUMBER_, record,         //
                 zVAR_DIMINDICES_, indices,       //
                 GET_, zVAR_DATA_, value, NULL_));
  });
}

double readHyperSingles(const Setup& setup) {
  Slab slab = wholeSlab(1, {});
  return timeSingles(setup, [&](CDFid file, long record, double* value) {
    slab.firstRecord = record;
    moveSlab(file, 0L, slab, GET_, value);
  });
}

/// A failing call and the text of its status.
double failInLibrary(const Setup& setup) {
  CDFid file = openFile(setup.file("series.cdf"));
  char text[256] = {};
  const Stopwatch watch;
  for (std::size_t i = 0; i < setup.calls(); ++i) {
    char name[CDF_VAR_NAME_LEN256 + 1];
    const CDFstatus status = CDFlib(SELECT_, CDF_, file, zVAR_, 99L, GET_, zVAR_NAME_, name, NULL_);
    CDFlib(SELECT_, CDF_STATUS_, status, GET_, STATUS_TEXT_, text, NULL_);
  }
  const double seconds = watch.seconds();
  closeFile(file);
  return seconds;
}

double breakEpochsDown(const Setup& setup) {
  const std::vector<double> epochs(setup.times(), 63113904000000.0);
  const Stopwatch watch;
  const Buffer<double> times = allocate<double>(7 * epochs.size());
  double* time = times.get();
  for (const double epoch : epochs) {
    long c[7];
    EPOCHbreakdown(epoch, &c[0], &c[1], &c[2], &c[3], &c[4], &c[5], &c[6]);
    for (const long component : c)
      *time++ = static_cast<double>(component);
  }
  return watch.seconds();
}

double computeEpochs(const Setup& setup) {
  const double given[] = {2000, 6, 15, 12, 30, 45, 500};
  std::vector<double> times;
  for (std::size_t i = 0; i < setup.times(); ++i)
    times.insert(times.end(), std::begin(given), std::end(given));
  const Stopwatch watch;
  const Buffer<double> epochs = allocate<double>(setup.times());
  const double* t = times.data();
  for (std::size_t i = 0; i < setup.times(); ++i, t += 7) {
    long c[7];
    std::copy_n(t, 7, c);
    epochs[i] = computeEPOCH(c[0], c[1], c[2], c[3], c[4], c[5], c[6]);
  }
  return watch.seconds();
}

double breakEpochs16Down(const Setup& setup) {
  std::vector<double> epochs(2 * setup.times(), 500.0);
  for (std::size_t i = 0; i < epochs.size(); i += 2)
    epochs[i] = 63113904000.0;
  const Stopwatch watch;
  const Buffer<double> times = allocate<double>(10 * setup.times());
  double* time = times.get();
  for (std::size_t i = 0; i < epochs.size(); i += 2) {
    long c[10];
    EPOCH16breakdown(&epochs[i], &c[0], &c[1], &c[2], &c[3], &c[4], &c[5], &c[6], &c[7], &c[8],
                     &c[9]);
    for (const long component : c)
      *time++ = static_cast<double>(component);
  }
  return watch.seconds();
}

double computeEpochs16(const Setup& setup) {
  const double given[] = {2000, 6, 15, 12, 30, 45, 500, 250, 125, 62};
  std::vector<double> times;
  for (std::size_t i = 0; i < setup.times(); ++i)
    times.insert(times.end(), std::begin(given), std::end(given));
  const Stopwatch watch;
  const Buffer<double> epochs = allocate<double>(2 * setup.times());
  const double* t = times.data();
  for (std::size_t i = 0; i < setup.times(); ++i, t += 10) {
    long c[10];
    std::copy_n(t, 10, c);
    computeEPOCH16(c[0], c[1], c[2], c[3], c[4], c[5], c[6], c[7], c[8], c[9], &epochs[2 * i]);
  }
  return watch.seconds();
}

}  // namespace ambrix_bench
