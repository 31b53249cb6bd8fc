#include "variables/datatypes.h"

#include <cstddef>
#include <cstring>
#include <locale>

#include "gateway/errors.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {
namespace {

[[noreturn]] void raiseUnrecognized(long code) {
  raiseError(cdflib::unrecognizedValue(code, "DATATYPE"));
}

/// The row of the datatype; raises if it is not supported.
const Datatype& requireDatatype(long code) {
  const Datatype* datatype = findDatatype(code);
  if (datatype == nullptr) raiseUnrecognized(code);
  return *datatype;
}

}  // namespace

void validateDatatype(long code) {
  requireDatatype(code);
}

qvClassID classIdForDatatype(long code) {
  return requireDatatype(code).classId;
}

long datatypeSize(long code) {
  const Datatype* datatype = findDatatype(code);
  return datatype == nullptr ? 0 : datatype->size;
}

std::size_t bytesOfArray(const qvArray* array, long code) {
  const long elementSize = code == CDF_EPOCH16 ? datatypeSize(CDF_EPOCH) : datatypeSize(code);
  return qvGetNumberOfElements(array) * static_cast<std::size_t>(elementSize);
}

std::string datatypeName(long code) {
  return requireDatatype(code).name;
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
  const Datatype& datatype = requireDatatype(code);
  const auto valueSize = static_cast<std::size_t>(datatype.size);
  const std::size_t values = buffer.size() / valueSize;
  const std::size_t sizes[] = {code == CDF_EPOCH16 ? 2UL : 1UL, values};
  qvArray* array = qvCreateUninitNumericArray(2, sizes, datatype.classId, qvREAL);
  const std::size_t bytes = values * valueSize;
  if (bytes > 0) std::memcpy(qvGetData(array), buffer.data(), bytes);
  return array;
}

}  // namespace TOLVEX::ambrix
