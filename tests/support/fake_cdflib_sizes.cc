#include "tests/support/fake_cdflib_sizes.h"

#include <gtest/gtest.h>

#include "tests/support/datatypes.h"
#include "tests/support/fake_cdflib.h"

namespace ambrix_test {
namespace {

std::size_t counted(double bytes) {
  if (!fakeCdflib().movesExactly()) return 0;  // nobody needs it
  if (bytes >= 0 && bytes <= kMostBytes) return static_cast<std::size_t>(bytes);
  ADD_FAILURE() << "the library would move " << bytes << " bytes";
  return 0;
}

double datatypeBytes(long code) {
  return static_cast<double>(libraryBytes(code));
}

double valueBytes() {
  const FakeCdflib& fake = fakeCdflib();
  return static_cast<double>(fake.number("zVAR_NUMELEMS_")) *
         datatypeBytes(fake.number("zVAR_DATATYPE_"));
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
  return counted(datatypeBytes(datatype) * static_cast<double>(elements));
}

}  // namespace ambrix_test
