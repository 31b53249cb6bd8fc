#include "constants/checked_values.h"

#include <cdf.h>

#include "gateway/errors.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {

qvArray* scopeName(std::int64_t scope) {
  switch (scope) {
    case GLOBAL_SCOPE:
      return qvCreateString("GLOBAL_SCOPE");
    case VARIABLE_SCOPE:
      return qvCreateString("VARIABLE_SCOPE");
    default:
      raiseError(cdflib::unrecognizedValue(scope, "SCOPE"));
  }
}

void checkCompressionType(std::int64_t type) {
  switch (type) {
    case NO_COMPRESSION:
    case RLE_COMPRESSION:
    case HUFF_COMPRESSION:
    case AHUFF_COMPRESSION:
    case GZIP_COMPRESSION:
      return;
    default:
      raiseError(cdflib::unrecognizedValue(type, "COMPRESSION"));
  }
}

}  // namespace TOLVEX::ambrix
