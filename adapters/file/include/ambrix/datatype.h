// The datatypes of values in CDF files.
#pragma once

#include <cstddef>
#include <optional>
#include <span>
#include <string>
#include <string_view>

#include "ambrix/array_view.h"
#include "ambrix/export.h"

namespace ambrix {

/// The code of a datatype, which is the library's. Files of later libraries may have others.
enum class Datatype : int {
  kInt1 = 1,
  kInt2 = 2,
  kInt4 = 4,
  kInt8 = 8,
  kUint1 = 11,
  kUint2 = 12,
  kUint4 = 14,
  kReal4 = 21,
  kReal8 = 22,
  kEpoch = 31,
  kEpoch16 = 32,
  kTimeTt2000 = 33,
  kByte = 41,
  kFloat = 44,
  kDouble = 45,
  kChar = 51,
  kUchar = 52,
};

/// What is known of a datatype. Commands take kInt8 and kTimeTt2000 only when the module is
/// extended (`Module::setExtended`); `File` always does.
struct DatatypeFacts {
  Datatype datatype;
  std::string_view name;  // as the commands tell it: "cdf_int4"
  ClassId classId;        // of arrays that hold its values
  /// The array elements of one value; 0 for characters, where it is the length of the text.
  std::size_t elements;
};

/// All datatypes of the CDF library, in the order of their codes.
AMBRIX_EXPORT std::span<const DatatypeFacts> datatypes() noexcept;

/// The facts of a datatype, or null for a code that the library does not have.
AMBRIX_EXPORT const DatatypeFacts* findDatatype(Datatype datatype) noexcept;
/// The datatype of that name, in upper or lower case.
AMBRIX_EXPORT std::optional<Datatype> datatypeNamed(std::string_view name) noexcept;
/// "cdf_int4"; "datatype 99" for a code that the library does not have.
AMBRIX_EXPORT std::string datatypeName(Datatype datatype);

/// Whether values are texts.
AMBRIX_EXPORT bool isCharacterType(Datatype datatype) noexcept;
/// Whether values are times (see times.h).
AMBRIX_EXPORT bool isTimeType(Datatype datatype) noexcept;

/// The array elements of one value: `characters` for a text, 2 for `CDF_EPOCH16`, else 1.
AMBRIX_EXPORT std::size_t elementsPerValue(Datatype datatype, std::size_t characters) noexcept;

}  // namespace ambrix
