#include "src/times.h"

#include <algorithm>
#include <cstdint>
#include <cstring>
#include <span>
#include <vector>

#include "ambrix/times.h"
#include "src/arguments.h"
#include "src/library.h"
#include "src/numpy.h"
#include "src/results.h"

namespace nb = nanobind;

namespace ambrix::python {
namespace {

template <typename T>
std::span<const T> elementsOf(nb::handle array) {
  PyArrayObject* const source = arrayOf(array);
  return {static_cast<const T*>(PyArray_DATA(source)),
          static_cast<std::size_t>(PyArray_SIZE(source))};
}

nb::object newIntegers(std::size_t count) {
  auto size = static_cast<npy_intp>(count);
  return orThrow(PyArray_SimpleNew(1, &size, NPY_INT64));
}

std::int64_t* dataOf(nb::handle array) {
  return static_cast<std::int64_t*>(PyArray_DATA(arrayOf(array)));
}

constexpr std::size_t kValuesAtOnce = 8192;  // which stay in the processor's cache; even

/// Converts part after part, so that new memory is touched once only.
void convertEpochs(std::span<const double> values, Datatype datatype, std::int64_t* times) {
  while (!values.empty()) {
    const std::span part = values.first(std::min(values.size(), kValuesAtOnce));
    const Array lent = Array::borrowed(part, {part.size()});
    const std::vector<std::int64_t> converted = timesAsNanoseconds(lent, datatype);
    times = std::copy(converted.begin(), converted.end(), times);
    values = values.subspan(part.size());
  }
}

/// Nanoseconds since 1970 of values of CDF_EPOCH, or pairs of CDF_EPOCH16: an array of doubles in
/// C's order. One dimension, whatever the array has.
nb::object epochsToNanoseconds(nb::handle array, int datatype) {
  const std::span<const double> values = elementsOf<double>(array);
  const auto type = static_cast<Datatype>(datatype);
  nb::object result = newIntegers(values.size() / elementsPerValue(type, 1));
  const nb::gil_scoped_release released;
  convertEpochs(values, type, dataOf(result));
  return result;
}

/// Leap seconds: from each of the times on, in ascending order, so much is to be taken off.
struct Offsets {
  std::span<const std::int64_t> from;
  std::span<const std::int64_t> offset;
};

/// Neighbours mostly lie in the same period: it is looked for only when a value leaves it.
void subtractOffsets(std::span<const std::int64_t> values, const Offsets& table,
                     std::int64_t* times) {
  std::size_t period = 0;
  std::int64_t begin = 1;
  std::int64_t end = 0;
  for (const std::int64_t value : values) {
    if (value < begin || value >= end) {
      const auto next = std::upper_bound(table.from.begin(), table.from.end(), value);
      period = static_cast<std::size_t>(next - table.from.begin());
      begin = period == 0 ? INT64_MIN : table.from[period - 1];
      end = period == table.from.size() ? INT64_MAX : table.from[period];
    }
    if (period == 0 || __builtin_sub_overflow(value, table.offset[period - 1], times)) {
      *times = kNoTime;
    }
    ++times;
  }
}

/// Nanoseconds since 1970 of values of CDF_TIME_TT2000, by a table; before its first time there is
/// none.
nb::object tt2000ToNanoseconds(nb::handle array, nb::handle from, nb::handle offset) {
  const std::span<const std::int64_t> values = elementsOf<std::int64_t>(array);
  const Offsets table{elementsOf<std::int64_t>(from), elementsOf<std::int64_t>(offset)};
  nb::object result = newIntegers(values.size());
  std::int64_t* const times = dataOf(result);
  const nb::gil_scoped_release released;
  subtractOffsets(values, table, times);
  return result;
}

/// A command of the extension, with one array and one result.
nb::object callExtended(const char* command, ArgumentKind kind, nb::handle value) {
  const Converted argument = convertArgument(kind, value);
  std::vector<Array> results;
  withExtendedModule([&](Module& module) { results = module.call(command, {argument.array}); });
  return convertResult(kind == ArgumentKind::kTimes ? ResultKind::kRow : ResultKind::kArray,
                       std::move(results.at(0)));
}

nb::object computeTt2000(nb::handle components) {
  return callExtended("computeTT2000", ArgumentKind::kTimes, components);
}

nb::object tt2000Breakdown(nb::handle values) {
  return callExtended("tt2000Breakdown", ArgumentKind::kValue, values);
}

}  // namespace

void bindTimes(nb::module_& module) {
  module.attr("LARGEST_TT2000_FILL") = kLargestTt2000Fill;
  module.def("epochs_to_nanoseconds", epochsToNanoseconds, nb::arg("array"), nb::arg("datatype"));
  module.def("compute_tt2000", computeTt2000, nb::arg("components"));
  module.def("tt2000_breakdown", tt2000Breakdown, nb::arg("values"));
  module.def("tt2000_to_nanoseconds", tt2000ToNanoseconds, nb::arg("array"), nb::arg("begins"),
             nb::arg("offsets"));
}

}  // namespace ambrix::python
