// Small things many times: values, and calls that touch no file.
#include <cstdint>

#include "bench/module/module_calls.h"
#include "variables/characters.h"

namespace ambrix_bench {
namespace {

/// The calls of a command that fails with an error of the module.
template <typename Call>
double timeFailures(const Setup& setup, const Call& failing) {
  const Stopwatch watch;
  for (std::size_t i = 0; i < setup.calls(); ++i) {
    try {
      failing();
    } catch (const ambrix::Error&) {
      continue;
    }
    return 0;
  }
  return watch.seconds();
}

/// Values here and there in the series.
double readRandom(const Setup& setup, const char* name) {
  const Array file = openFile(setup, name);
  const Array variable = number(0);
  const std::size_t count = setup.singles();
  std::uint64_t state = 1;
  const Stopwatch watch;
  for (std::size_t i = 0; i < count / 100; ++i) {
    state = state * 6364136223846793005U + 1442695040888963407U;
    call("getVarData", {file, variable, number(static_cast<double>((state >> 33U) % count))});
  }
  const double seconds = watch.seconds();
  closeFile(file);
  return seconds;
}

}  // namespace

double readSingles(const Setup& setup) {
  const Array file = openFile(setup, "series.cdf");
  const Array command = Array::fromNarrow("getVarData"), variable = number(0);
  double sum = 0;
  const Stopwatch watch;
  for (std::size_t i = 0; i < setup.singles(); ++i) {
    const Array record = number(static_cast<double>(i));
    sum += theModule().call(command, {file, variable, record})[0].data<double>()[0];
  }
  const double seconds = watch.seconds();
  closeFile(file);
  return sum == 0 ? 0 : seconds;
}

double readHyperSingles(const Setup& setup) {
  const Array file = openFile(setup, "series.cdf");
  const Array command = Array::fromNarrow("hyperGetVarData"), variable = number(0);
  const Array one = number(1), none = Array::zeros(ClassId::kDouble, {});
  double sum = 0;
  const Stopwatch watch;
  for (std::size_t i = 0; i < setup.singles(); ++i) {
    const Array record = number(static_cast<double>(i));
    sum += theModule()
               .call(command, {file, variable, record, one, one, none, none, none})[0]
               .data<double>()[0];
  }
  const double seconds = watch.seconds();
  closeFile(file);
  return sum == 0 ? 0 : seconds;
}

double readRandomGzip(const Setup& setup) {
  return readRandom(setup, "series_gzip.cdf");
}
double readRandomGzipBlocks(const Setup& setup) {
  return readRandom(setup, "series_gzip_100.cdf");
}

double getConstant(const Setup& setup) {
  const Array command = Array::fromNarrow("getConstantValue");
  const Array name = Array::fromNarrow("GZIP_COMPRESSION");
  const Stopwatch watch;
  for (std::size_t i = 0; i < setup.calls(); ++i)
    theModule().call(command, {name});
  return watch.seconds();
}

double callUnknown(const Setup& setup) {
  const Array command = Array::fromNarrow("getEverything");
  return timeFailures(setup, [&] { theModule().call(command); });
}

double refuseArgument(const Setup& setup) {
  const Array command = Array::fromNarrow("close"), file = number(1);
  return timeFailures(setup, [&] { theModule().call(command, {file}); });
}

double failInLibrary(const Setup& setup) {
  const Array file = openFile(setup, "series.cdf");
  const Array command = Array::fromNarrow("getVarName"), variable = number(99);
  const double seconds = timeFailures(setup, [&] { theModule().call(command, {file, variable}); });
  closeFile(file);
  return seconds;
}

double widen(const Setup& setup) {
  const std::vector<char> bytes(setup.times(), 'a');
  std::vector<char16_t> characters(bytes.size());
  const Stopwatch watch;
  for (int i = 0; i < 20; ++i)
    TOLVEX::ambrix::widenCharacters(bytes.data(), bytes.size(), characters.data());
  return watch.seconds();
}

double narrow(const Setup& setup) {
  const std::vector<char16_t> characters(setup.times(), u'a');
  std::vector<char> bytes(characters.size());
  const Stopwatch watch;
  for (int i = 0; i < 20; ++i)
    TOLVEX::ambrix::narrowCharacters(characters.data(), bytes.size(), bytes.data());
  return watch.seconds();
}

}  // namespace ambrix_bench
