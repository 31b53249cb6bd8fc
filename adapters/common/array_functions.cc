// Those of the module's array functions that are the same in all hosts, once a host can make an
// array and give its class and data.
#include "adapters/common/array_functions.h"

#include <stdexcept>
#include <string_view>

#include "adapters/common/narrow_text.h"

using ambrix::Content;
using ambrix::makeInCall;

namespace {

bool hasClass(const qvArray* array, qvClassID classId) {
  return qvGetClassID(array) == classId;
}

qvArray* makeNumbers(std::span<const std::size_t> sizes, qvClassID classId, qvComplexity complexity,
                     Content content) {
  if (classId < qvDOUBLE_CLASS) throw std::logic_error("a numeric array needs a numeric class");
  if (complexity != qvREAL) throw std::logic_error("there are no complex arrays here");
  return makeInCall(classId, sizes, content);
}

}  // namespace

const bool* qvGetLogicals(const qvArray* array) {
  if (!hasClass(array, qvLOGICAL_CLASS)) return nullptr;
  return static_cast<const bool*>(qvGetReadOnlyData(array));
}

const char16_t* qvGetReadOnlyChars(const qvArray* array) {
  if (!hasClass(array, qvCHAR_CLASS)) return nullptr;
  return static_cast<const char16_t*>(qvGetReadOnlyData(array));
}

char16_t* qvGetChars(qvArray* array) {
  return hasClass(array, qvCHAR_CLASS) ? static_cast<char16_t*>(qvGetData(array)) : nullptr;
}

qvArray* qvCreateNumericArray(std::size_t dimensions, const std::size_t* sizes, qvClassID classId,
                              qvComplexity complexity) {
  return makeNumbers({sizes, dimensions}, classId, complexity, Content::kZero);
}

qvArray* qvCreateUninitNumericArray(std::size_t dimensions, const std::size_t* sizes,
                                    qvClassID classId, qvComplexity complexity) {
  return makeNumbers({sizes, dimensions}, classId, complexity, Content::kUnset);
}

qvArray* qvCreateNumericMatrix(std::size_t rows, std::size_t columns, qvClassID classId,
                               qvComplexity complexity) {
  const std::size_t sizes[] = {rows, columns};
  return makeNumbers(sizes, classId, complexity, Content::kZero);
}

qvArray* qvCreateDoubleScalar(double value) {
  const std::size_t sizes[] = {1, 1};
  qvArray* const array = makeInCall(qvDOUBLE_CLASS, sizes, Content::kUnset);
  *static_cast<double*>(qvGetData(array)) = value;
  return array;
}

qvArray* qvCreateLogicalArray(std::size_t dimensions, const std::size_t* sizes) {
  return makeInCall(qvLOGICAL_CLASS, {sizes, dimensions}, Content::kZero);
}

qvArray* qvCreateCharArray(std::size_t dimensions, const std::size_t* sizes) {
  return makeInCall(qvCHAR_CLASS, {sizes, dimensions}, Content::kUnset);
}

qvArray* qvCreateString(const char* text) {
  const std::string_view bytes = text == nullptr ? std::string_view() : text;
  const std::size_t sizes[] = {bytes.empty() ? 0U : 1U, bytes.size()};
  qvArray* const array = makeInCall(qvCHAR_CLASS, sizes, Content::kUnset);
  ambrix::widen(bytes, qvGetChars(array));
  return array;
}

qvArray* qvCreateCellMatrix(std::size_t rows, std::size_t columns) {
  const std::size_t sizes[] = {rows, columns};
  return makeInCall(qvCELL_CLASS, sizes, Content::kZero);
}
