// Times converted by the million.
#include "bench/module/module_calls.h"

namespace ambrix_bench {
namespace {

/// The same group of numbers so many times, and a command on all of them.
double convert(const char* command, std::size_t count, std::initializer_list<double> group) {
  std::vector<double> numbers;
  for (std::size_t i = 0; i < count; ++i)
    numbers.insert(numbers.end(), group);
  const Array given = row(numbers);
  const Stopwatch watch;
  const Array result = call(command, {given});
  return watch.seconds();
}

}  // namespace

double breakEpochsDown(const Setup& setup) {
  return convert("epochBreakdown", setup.times(), {63113904000000.0});
}
double computeEpochs(const Setup& setup) {
  return convert("computeEpoch", setup.times(), {2000, 6, 15, 12, 30, 45, 500});
}
double breakEpochs16Down(const Setup& setup) {
  return convert("epoch16Breakdown", setup.times(), {63113904000.0, 500});
}
double computeEpochs16(const Setup& setup) {
  return convert("computeEpoch16", setup.times(), {2000, 6, 15, 12, 30, 45, 500, 250, 125, 62});
}

}  // namespace ambrix_bench
