#include "tests/support/fake_cdflib_sizes.h"

#include <gtest/gtest.h>

#include <map>

#include "tests/support/fake_cdflib.h"

namespace ambrix_test {
namespace {

// By the library's manual; it knows two datatypes that the module does not support.
const std::map<long, double> kSizes = {{1, 1},  {2, 2},  {4, 4},  {8, 8},  {11, 1},  {12, 2},
                                       {14, 4}, {21, 4}, {22, 8}, {31, 8}, {32, 16}, {33, 8},
                                       {41, 1}, {44, 4}, {45, 8}, {51, 1}, {52, 1}};

std::size_t counted(double bytes) {
  if (!fakeCdflib().movesExactly()) return 0;  // nobody needs it
  if (bytes >= 0 && bytes <= kMostBytes) return static_cast<std::size_t>(bytes);
  ADD_FAILURE() << "the library would move " << bytes << " bytes";
  return 0;
}

double elementBytes(long datatype) {
  const auto found = kSizes.find(datatype);
  return found == kSizes.end() ? 0 : found->second;
}

double valueBytes() {
  const FakeCdflib& fake = fakeCdflib();
  return static_cast<double>(fake.number("zVAR_NUMELEMS_")) *
         elementBytes(fake.number("zVAR_DATATYPE_"));
}

}  // namespace

std::size_t bytesOfValue() {
  return counted(valueBytes());
}

std::size_t bytesOfRecord() {
  const FakeCdflib& fake = fakeCdflib();
  double bytes = valueBytes();
  for (std::size_t i = 0; i < fake.numbers("zVAR_DIMSIZES_").size(); ++i) {
    if (fake.number("zVAR_DIMVARYS_", i) != 0)
      bytes *= static_cast<double>(fake.number("zVAR_DIMSIZES_", i));
  }
  return counted(bytes);
}

std::size_t bytesOfHyperslab(long records, std::span<const long> counts) {
  double bytes = valueBytes() * static_cast<double>(records);
  for (const long count : counts) {
    if (count < 1) return 0;
    bytes *= static_cast<double>(count);
  }
  return records < 1 ? 0 : counted(bytes);
}

std::size_t bytesOfEntry(long datatype, long elements) {
  return counted(elementBytes(datatype) * static_cast<double>(elements));
}

}  // namespace ambrix_test
