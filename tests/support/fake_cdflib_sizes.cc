#include "tests/support/fake_cdflib_sizes.h"

#include <gtest/gtest.h>

#include <algorithm>

#include "tests/support/fake_cdflib.h"

namespace ambrix_test {
namespace {

std::size_t counted(std::optional<std::size_t> bytes) {
  if (!fakeCdflib().movesExactly()) return 0;  // nobody needs it
  if (bytes && *bytes <= kMostBytes) return *bytes;
  ADD_FAILURE() << "the library would move too much";
  return 0;
}

}  // namespace

LibraryVariable describedVariable() {
  const FakeCdflib& fake = fakeCdflib();
  const Numbers& sizes = fake.numbers("zVAR_DIMSIZES_");
  const std::size_t dimensions = std::min(sizes.size(), kLibraryDimensions);
  LibraryVariable variable{.datatype = fake.number("zVAR_DATATYPE_"),
                           .elements = fake.number("zVAR_NUMELEMS_"),
                           .dimensions = static_cast<long>(dimensions),
                           .recordVariance = fake.number("zVAR_RECVARY_")};
  for (std::size_t i = 0; i < dimensions; ++i) {
    variable.sizes[i] = sizes[i];
    variable.variances[i] = fake.number("zVAR_DIMVARYS_", i);
  }
  return variable;
}

std::size_t bytesOfValues(long values) {
  return counted(bytesOf(describedVariable(), values));
}

std::size_t bytesOfEntry(long datatype, long elements) {
  return counted(bytesOf({.datatype = datatype, .elements = elements}, 1));
}

}  // namespace ambrix_test
