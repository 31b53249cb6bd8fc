#include "variables/datatypes.h"

#include <cdf.h>

#include <array>
#include <boost/assign/list_of.hpp>
#include <cstddef>
#include <cstring>
#include <iterator>
#include <locale>
#include <map>

#include "gateway/errors.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {
namespace {

struct Datatype {
  long code;
  qvClassID classId;
  long size;
};

constexpr Datatype kDatatypes[] = {
    {CDF_INT1, qvINT8_CLASS, 1},     {CDF_INT2, qvINT16_CLASS, 2},
    {CDF_INT4, qvINT32_CLASS, 4},    {CDF_UINT1, qvUINT8_CLASS, 1},
    {CDF_UINT2, qvUINT16_CLASS, 2},  {CDF_UINT4, qvUINT32_CLASS, 4},
    {CDF_REAL4, qvSINGLE_CLASS, 4},  {CDF_REAL8, qvDOUBLE_CLASS, 8},
    {CDF_EPOCH, qvDOUBLE_CLASS, 8},  {CDF_EPOCH16, qvDOUBLE_CLASS, 16},
    {CDF_BYTE, qvINT8_CLASS, 1},     {CDF_FLOAT, qvSINGLE_CLASS, 4},
    {CDF_DOUBLE, qvDOUBLE_CLASS, 8}, {CDF_CHAR, qvCHAR_CLASS, 1},
    {CDF_UCHAR, qvCHAR_CLASS, 1},
};
static_assert(std::size(kDatatypes) == 15);

/// The row of each code, or null.
constexpr auto kRowOfCode = [] {
  std::array<const Datatype*, 64> rows{};
  for (const Datatype& row : kDatatypes)
    rows[static_cast<std::size_t>(row.code)] = &row;
  return rows;
}();

const Datatype* findDatatype(long code) {
  const auto index = static_cast<std::size_t>(code);  // a negative code becomes a large one
  return index < kRowOfCode.size() ? kRowOfCode[index] : nullptr;
}

[[noreturn]] void raiseUnrecognized(long code) {
  raiseError(cdflib::unrecognizedValue(code, "DATATYPE"));
}

const std::map<long, std::string>& datatypeNames() {
  static const std::map<long, std::string> names = boost::assign::map_list_of<long, std::string>  //
      (CDF_BYTE, "CDF_BYTE")(CDF_CHAR, "CDF_CHAR")(CDF_DOUBLE, "CDF_DOUBLE")                      //
      (CDF_EPOCH, "CDF_EPOCH")(CDF_EPOCH16, "CDF_EPOCH16")(CDF_FLOAT, "CDF_FLOAT")                //
      (CDF_INT1, "CDF_INT1")(CDF_INT2, "CDF_INT2")(CDF_INT4, "CDF_INT4")                          //
      (CDF_REAL4, "CDF_REAL4")(CDF_REAL8, "CDF_REAL8")(CDF_UCHAR, "CDF_UCHAR")                    //
      (CDF_UINT1, "CDF_UINT1")(CDF_UINT2, "CDF_UINT2")(CDF_UINT4, "CDF_UINT4");
  return names;
}

}  // namespace

void validateDatatype(long code) {
  if (findDatatype(code) == nullptr) raiseUnrecognized(code);
}

qvClassID classIdForDatatype(long code) {
  const Datatype* datatype = findDatatype(code);
  if (datatype == nullptr) raiseUnrecognized(code);
  return datatype->classId;
}

long datatypeSize(long code) {
  const Datatype* datatype = findDatatype(code);
  return datatype == nullptr ? 0 : datatype->size;
}

std::size_t bytesOfArray(const qvArray* array, long code) {
  const long elementSize = code == CDF_EPOCH16 ? datatypeSize(CDF_EPOCH) : datatypeSize(code);
  return qvGetNumberOfElements(array) * static_cast<std::size_t>(elementSize);
}

bool isCharacterDatatype(long code) {
  return code == CDF_CHAR || code == CDF_UCHAR;
}

std::string datatypeName(long code) {
  const auto found = datatypeNames().find(code);
  if (found == datatypeNames().end()) raiseUnrecognized(code);
  return found->second;
}

qvArray* datatypeNameArray(long code) {
  std::string name = datatypeName(code);
  const std::locale locale;
  for (char& c : name)
    c = std::tolower(c, locale);
  return qvCreateString(name.c_str());
}

qvArray* createArrayFromBuffer(const ValueBuffer& buffer, long code) {
  if (isCharacterDatatype(code)) {
    return qvCreateString(reinterpret_cast<const char*>(buffer.data()));
  }
  const qvClassID classId = classIdForDatatype(code);
  const auto valueSize = static_cast<std::size_t>(datatypeSize(code));
  const std::size_t values = buffer.size() / valueSize;
  const std::size_t sizes[] = {code == CDF_EPOCH16 ? 2UL : 1UL, values};
  qvArray* array = qvCreateUninitNumericArray(2, sizes, classId, qvREAL);
  const std::size_t bytes = values * valueSize;
  if (bytes > 0) std::memcpy(qvGetData(array), buffer.data(), bytes);
  return array;
}

}  // namespace TOLVEX::ambrix
