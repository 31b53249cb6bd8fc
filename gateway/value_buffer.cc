#include "gateway/value_buffer.h"

#include <cdf.h>

#include <cstddef>
#include <new>

#include "gateway/sizes.h"

namespace TOLVEX::ambrix {
namespace {

std::size_t bytesForValues(long datatype, long count) {
  switch (datatype) {
    case CDF_INT1:
    case CDF_UINT1:
    case CDF_BYTE:
      return saturatedProduct({count});
    case CDF_INT2:
    case CDF_UINT2:
      return saturatedProduct({2, count});
    case CDF_INT4:
    case CDF_UINT4:
    case CDF_REAL4:
    case CDF_FLOAT:
      return saturatedProduct({4, count});
    case CDF_REAL8:
    case CDF_EPOCH:
    case CDF_DOUBLE:
      return saturatedProduct({8, count});
    case CDF_EPOCH16:
      return saturatedProduct({16, count});
    case CDF_CHAR:
    case CDF_UCHAR:
      return saturatedProduct({count}) + 1;
    default:
      return 0;
  }
}

}  // namespace

void resizeValueBuffer(ValueBuffer& buffer, long datatype, long count) {
  const std::size_t bytes = bytesForValues(datatype, count);
  if (bytes > buffer.max_size()) throw std::bad_alloc();
  buffer.resize(bytes);
}

}  // namespace TOLVEX::ambrix
