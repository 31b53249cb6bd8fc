#include "gateway/datatype_table.h"

#include <algorithm>
#include <span>

#include "gateway/extension.h"

namespace TOLVEX::ambrix {

const Datatype* findExtendedDatatype(long code) {
  const std::span<const Datatype> rows = extension().datatypes;
  const auto found = std::ranges::find(rows, code, &Datatype::code);
  return found == rows.end() ? nullptr : &*found;
}

}  // namespace TOLVEX::ambrix
