#include "bench/library/plain_calls.h"

#include <algorithm>
#include <filesystem>

namespace ambrix_bench {

CDFid createFile(const std::string& name, long majority) {
  std::filesystem::remove(name + ".cdf");
  std::string copy = name;
  CDFid file = nullptr;
  check(CDFcreateCDF(copy.data(), &file));
  check(CDFlib(SELECT_, CDF_, file, PUT_, CDF_MAJORITY_, majority, NULL_));
  return file;
}

long createVariable(CDFid file, const NewVariable& variable) {
  long sizes[CDF_MAX_DIMS] = {}, variances[CDF_MAX_DIMS] = {}, number = 0;
  std::ranges::copy(variable.sizes, sizes);
  std::fill_n(variances, variable.sizes.size(), VARY);
  check(CDFlib(SELECT_, CDF_, file, CREATE_, zVAR_, variable.name, variable.datatype,
               variable.elements, static_cast<long>(variable.sizes.size()), sizes, VARY, variances,
               &number, NULL_));
  return number;
}

Slab wholeSlab(std::size_t records, std::span<const long> sizes) {
  Slab slab;
  slab.records = static_cast<long>(records);
  std::ranges::copy(sizes, slab.count);
  std::fill_n(slab.interval, sizes.size(), 1L);
  return slab;
}

}  // namespace ambrix_bench
