#include "gateway/value_buffer.h"

#include <cstddef>
#include <new>

#include "gateway/datatype_table.h"
#include "gateway/sizes.h"

namespace TOLVEX::ambrix {
namespace {

std::size_t bytesForValues(long code, long count) {
  const Datatype* datatype = findDatatype(code);
  if (datatype == nullptr) return 0;
  const std::size_t terminator = isCharacterDatatype(code) ? 1 : 0;
  return saturatedProduct({datatype->size, count}) + terminator;
}

}  // namespace

void resizeValueBuffer(ValueBuffer& buffer, long datatype, long count) {
  const std::size_t bytes = bytesForValues(datatype, count);
  if (bytes > buffer.max_size()) throw std::bad_alloc();
  buffer.resize(bytes);
}

}  // namespace TOLVEX::ambrix
