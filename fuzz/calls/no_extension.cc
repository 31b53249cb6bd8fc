// What stands in the place of extended/ in a module without it.
#include "gateway/datatype_table.h"
#include "gateway/extension.h"

namespace TOLVEX::ambrix {

const Extension& extension() {
  static constexpr Extension kNone;
  return kNone;
}

}  // namespace TOLVEX::ambrix
