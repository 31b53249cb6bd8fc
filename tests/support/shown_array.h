// Arrays as text, for tests that compare a whole array at once.
#pragma once

#include <ambrix/embedded.h>

#include <string>

namespace ambrix_test {

/// Class, size and data: "double 1x2 [3 4.5]", "char 1x3 'abc'", "logical 1x1 [1]", "cell 2x1
/// {...}".
std::string shown(ambrix::ArrayView array);

}  // namespace ambrix_test
