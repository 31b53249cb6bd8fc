// The table of CDF datatypes: all that the module knows of each. A code that is not in it, also one
// that the library knows (8, 33), is not supported unless the host offers extended datatypes.
#pragma once

#include <cdf.h>

#include <array>
#include <cstddef>
#include <iterator>

#include "host/qv.h"

namespace TOLVEX::ambrix {

struct Datatype {
  long code;
  const char* name;   // as messages show it
  qvClassID classId;  // of the host array that carries its values
  long size;          // bytes of one value in the library's buffers
};

// clang-format off
inline constexpr Datatype kDatatypes[] = {
    {CDF_INT1,    "CDF_INT1",    qvINT8_CLASS,   1},
    {CDF_INT2,    "CDF_INT2",    qvINT16_CLASS,  2},
    {CDF_INT4,    "CDF_INT4",    qvINT32_CLASS,  4},
    {CDF_UINT1,   "CDF_UINT1",   qvUINT8_CLASS,  1},
    {CDF_UINT2,   "CDF_UINT2",   qvUINT16_CLASS, 2},
    {CDF_UINT4,   "CDF_UINT4",   qvUINT32_CLASS, 4},
    {CDF_REAL4,   "CDF_REAL4",   qvSINGLE_CLASS, 4},
    {CDF_REAL8,   "CDF_REAL8",   qvDOUBLE_CLASS, 8},
    {CDF_EPOCH,   "CDF_EPOCH",   qvDOUBLE_CLASS, 8},
    {CDF_EPOCH16, "CDF_EPOCH16", qvDOUBLE_CLASS, 16},  // two doubles
    {CDF_BYTE,    "CDF_BYTE",    qvINT8_CLASS,   1},
    {CDF_FLOAT,   "CDF_FLOAT",   qvSINGLE_CLASS, 4},
    {CDF_DOUBLE,  "CDF_DOUBLE",  qvDOUBLE_CLASS, 8},
    {CDF_CHAR,    "CDF_CHAR",    qvCHAR_CLASS,   1},
    {CDF_UCHAR,   "CDF_UCHAR",   qvCHAR_CLASS,   1},
};
// clang-format on
static_assert(std::size(kDatatypes) == 15);

/// The row of each code, or null.
inline constexpr auto kDatatypeOfCode = [] {
  std::array<const Datatype*, 64> rows{};
  for (const Datatype& row : kDatatypes)
    rows[static_cast<std::size_t>(row.code)] = &row;
  return rows;
}();

/// The row of a datatype that only the host's extension has, or null.
const Datatype* findExtendedDatatype(long code);

/// The row of the datatype, or null if it is not supported.
inline const Datatype* findDatatype(long code) {
  const auto index = static_cast<std::size_t>(code);  // a negative code becomes a large one
  const Datatype* row = index < kDatatypeOfCode.size() ? kDatatypeOfCode[index] : nullptr;
  return row != nullptr ? row : findExtendedDatatype(code);
}

/// Whether values of the datatype are texts.
inline bool isCharacterDatatype(long code) {
  return code == CDF_CHAR || code == CDF_UCHAR;
}

}  // namespace TOLVEX::ambrix
