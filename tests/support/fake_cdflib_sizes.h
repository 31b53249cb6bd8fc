// How many bytes the library moves: numbers of elements and sizes as the stand-in was told, whether
// they make sense or not.
#pragma once

#include <cstddef>
#include <span>

namespace ambrix_test {

/// A description whose data are larger than this must never get as far as data: the test fails.
inline constexpr std::size_t kMostBytes = 1 << 24;

std::size_t bytesOfValue();
/// Along dimensions that do not vary one value is stored.
std::size_t bytesOfRecord();
/// Nothing if the library refuses a count.
std::size_t bytesOfHyperslab(long records, std::span<const long> counts);
std::size_t bytesOfEntry(long datatype, long elements);

}  // namespace ambrix_test
