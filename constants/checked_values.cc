#include "constants/checked_values.h"

#include "constants/value_names.h"

namespace TOLVEX::ambrix {

qvArray* scopeName(std::int64_t scope) {
  return qvCreateString(lookupValueName(ScopeNames, scope, "SCOPE").c_str());
}

void checkCompressionType(std::int64_t type) {
  lookupValueName(CompressionNames, type, "COMPRESSION");
}

}  // namespace TOLVEX::ambrix
