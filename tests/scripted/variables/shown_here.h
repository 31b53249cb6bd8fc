// An array that a function of the module has made, shown and destroyed.
#pragma once

#include <string>

#include "tests/support/scripted_test.h"

namespace ambrix_test {

inline std::string shownHere(qvArray* array) {
  return shown(Array::adopt(array));
}

}  // namespace ambrix_test
