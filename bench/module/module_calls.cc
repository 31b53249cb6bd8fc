#include "bench/module/module_calls.h"

#include <utility>

namespace ambrix_bench {

ambrix::Module& theModule() {
  static ambrix::Module module;
  return module;
}

Array call(std::string_view command, std::initializer_list<ArrayView> arguments) {
  std::vector<Array> results = theModule().call(command, arguments);
  return results.empty() ? Array() : std::move(results.front());
}

Array row(std::span<const double> values) {
  return Array::fromBytes(ClassId::kDouble, {1, values.size()}, std::as_bytes(values));
}

Array openFile(const Setup& setup, std::string_view name) {
  return call("open", {Array::fromUtf8(setup.file(name))});
}

Slab wholeSlab(std::size_t records, std::span<const long> sizes) {
  Slab slab{records, {}, std::vector<double>(sizes.size(), 1)};
  for (auto size = sizes.rbegin(); size != sizes.rend(); ++size)
    slab.counts.push_back(static_cast<double>(*size));
  return slab;
}

Slab everySecond(std::size_t records, std::span<const long> sizes) {
  Slab slab = wholeSlab(records, sizes);
  for (double& count : slab.counts)
    count /= 2;
  slab.intervals.assign(sizes.size(), 2);
  return slab;
}

Array readSlab(const Array& file, const Slab& slab) {
  const std::vector<double> start(slab.counts.size(), 0);
  return call("hyperGetVarData",
              {file, number(0), number(0), number(static_cast<double>(slab.records)), number(1),
               row(start), row(slab.counts), row(slab.intervals)});
}

}  // namespace ambrix_bench
