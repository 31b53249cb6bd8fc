// Results on their way to the host.
#pragma once

#include <algorithm>
#include <initializer_list>

#include "host/qv.h"

namespace TOLVEX::ambrix {

/// A library number as a double scalar.
inline qvArray* makeDoubleScalar(long value) {
  return qvCreateDoubleScalar(static_cast<double>(value));
}

/// Fills the slots from the first. The arrays are made before any slot is touched, so a failure
/// among them leaves all slots as they were.
inline void setOutputs(qvArray* outputs[], std::initializer_list<qvArray*> arrays) {
  std::copy(arrays.begin(), arrays.end(), outputs);
}

}  // namespace TOLVEX::ambrix
