// The datatypes that the commands know, typed by hand. Tests and fuzzers read them here;
// tests/scripted/variables/datatypes_test.cc compares them with the module.
#pragma once

#include <ambrix/array_view.h>

#include <algorithm>
#include <cctype>
#include <cstddef>
#include <iterator>
#include <string>
#include <string_view>

namespace ambrix_test {

struct CdfDatatype {
  long code;
  std::string_view name;
  /// Of the arrays that carry its values, and what messages call it.
  ::ambrix::ClassId classId;
  const char* className;
  /// Of one value in the library's buffers.
  std::size_t bytes;
};

// clang-format off
inline constexpr CdfDatatype kCdfDatatypes[] = {
    {1,  "CDF_INT1",    ::ambrix::ClassId::kInt8,   "int8",   1},
    {2,  "CDF_INT2",    ::ambrix::ClassId::kInt16,  "int16",  2},
    {4,  "CDF_INT4",    ::ambrix::ClassId::kInt32,  "int32",  4},
    {11, "CDF_UINT1",   ::ambrix::ClassId::kUint8,  "uint8",  1},
    {12, "CDF_UINT2",   ::ambrix::ClassId::kUint16, "uint16", 2},
    {14, "CDF_UINT4",   ::ambrix::ClassId::kUint32, "uint32", 4},
    {21, "CDF_REAL4",   ::ambrix::ClassId::kSingle, "single", 4},
    {22, "CDF_REAL8",   ::ambrix::ClassId::kDouble, "double", 8},
    {31, "CDF_EPOCH",   ::ambrix::ClassId::kDouble, "double", 8},
    {32, "CDF_EPOCH16", ::ambrix::ClassId::kDouble, "double", 16},
    {41, "CDF_BYTE",    ::ambrix::ClassId::kInt8,   "int8",   1},
    {44, "CDF_FLOAT",   ::ambrix::ClassId::kSingle, "single", 4},
    {45, "CDF_DOUBLE",  ::ambrix::ClassId::kDouble, "double", 8},
    {51, "CDF_CHAR",    ::ambrix::ClassId::kChar,   "char",   1},
    {52, "CDF_UCHAR",   ::ambrix::ClassId::kChar,   "char",   1},
};
// clang-format on
static_assert(std::size(kCdfDatatypes) == 15);

/// Known to the library, and to no command unless the host is extended.
inline constexpr long kInt8 = 8;
inline constexpr long kTt2000 = 33;
inline constexpr long kOtherDatatypes[] = {kInt8, kTt2000};

/// Two elements of an array are one of its values.
inline constexpr long kEpoch16 = 32;

/// Null for a datatype that no command knows.
inline const CdfDatatype* findCdfDatatype(long code) {
  const auto* found = std::ranges::find(kCdfDatatypes, code, &CdfDatatype::code);
  return found == std::end(kCdfDatatypes) ? nullptr : found;
}

/// Of one value of any datatype that the library knows; 0 for others.
inline std::size_t libraryBytes(long code) {
  const CdfDatatype* datatype = findCdfDatatype(code);
  if (datatype != nullptr) return datatype->bytes;
  return std::ranges::find(kOtherDatatypes, code) == std::end(kOtherDatatypes) ? 0 : 8;
}

inline bool isText(const CdfDatatype& datatype) {
  return datatype.classId == ::ambrix::ClassId::kChar;
}

/// Of one element of an array.
inline std::size_t elementBytes(const CdfDatatype& datatype) {
  return datatype.code == kEpoch16 ? datatype.bytes / 2 : datatype.bytes;
}

/// As inquiries give it.
inline std::string lowerCaseName(const CdfDatatype& datatype) {
  std::string name(datatype.name);
  std::ranges::transform(name, name.begin(), [](unsigned char c) { return std::tolower(c); });
  return name;
}

}  // namespace ambrix_test
