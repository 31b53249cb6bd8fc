// How many bytes the stand-in moves: numbers of elements and sizes as it was told, whether they
// make sense or not.
#pragma once

#include <cstddef>

#include "tests/support/library_variable.h"

namespace ambrix_test {

/// A description whose data are larger than this must never get as far as data: the test fails.
inline constexpr std::size_t kMostBytes = 1 << 24;

/// As the stand-in was told of it.
LibraryVariable describedVariable();

/// Of that variable.
std::size_t bytesOfValues(long values);
std::size_t bytesOfEntry(long datatype, long elements);

}  // namespace ambrix_test
