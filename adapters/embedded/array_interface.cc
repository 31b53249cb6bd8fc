// The array functions that the module calls.
#include <span>
#include <stdexcept>
#include <string_view>

#include "adapters/embedded/array_object.h"
#include "adapters/embedded/call_frame.h"
#include "ambrix/array_view.h"

using ambrix::Content;

namespace {

/// Gives a new array to the call under way, if there is one.
qvArray* tracked(qvArray* array) noexcept {
  if (ambrix::CallFrame* const frame = ambrix::CallFrame::current()) frame->trackArray(*array);
  return array;
}

qvArray* makeTracked(qvClassID classId, std::span<const std::size_t> sizes, Content content) {
  return tracked(ambrix::makeArray(classId, sizes, content));
}

qvArray* makeNumbers(std::span<const std::size_t> sizes, qvClassID classId, qvComplexity complexity,
                     Content content) {
  if (classId < qvDOUBLE_CLASS) throw std::logic_error("a numeric array needs a numeric class");
  if (complexity != qvREAL) throw std::logic_error("this host has no complex arrays");
  return makeTracked(classId, sizes, content);
}

bool hasClass(const qvArray* array, qvClassID classId) {
  return array->classId == classId;
}

}  // namespace

qvClassID qvGetClassID(const qvArray* array) {
  return array->classId;
}

const char* qvGetClassName(const qvArray* array) {
  return ambrix::ArrayView(array).className();
}

std::size_t qvGetNumberOfElements(const qvArray* array) {
  return array->elementCount;
}
std::size_t qvGetNumberOfDimensions(const qvArray* array) {
  return array->dimensionCount;
}
const std::size_t* qvGetDimensions(const qvArray* array) {
  return array->sizes();
}

const void* qvGetReadOnlyData(const qvArray* array) {
  return hasClass(array, qvCELL_CLASS) ? nullptr : array->elements;
}

void* qvGetData(qvArray* array) {
  return hasClass(array, qvCELL_CLASS) ? nullptr : array->elements;
}

const bool* qvGetLogicals(const qvArray* array) {
  return hasClass(array, qvLOGICAL_CLASS) ? static_cast<const bool*>(array->elements) : nullptr;
}

const char16_t* qvGetReadOnlyChars(const qvArray* array) {
  return hasClass(array, qvCHAR_CLASS) ? static_cast<const char16_t*>(array->elements) : nullptr;
}

char16_t* qvGetChars(qvArray* array) {
  return hasClass(array, qvCHAR_CLASS) ? static_cast<char16_t*>(array->elements) : nullptr;
}

const qvArray* qvGetCell(const qvArray* array, std::size_t index) {
  if (!hasClass(array, qvCELL_CLASS) || index >= array->elementCount) return nullptr;
  return array->cells()[index];
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
  qvArray* const array = makeTracked(qvDOUBLE_CLASS, sizes, Content::kUnset);
  *static_cast<double*>(array->elements) = value;
  return array;
}

qvArray* qvCreateLogicalArray(std::size_t dimensions, const std::size_t* sizes) {
  return makeTracked(qvLOGICAL_CLASS, {sizes, dimensions}, Content::kZero);
}

qvArray* qvCreateCharArray(std::size_t dimensions, const std::size_t* sizes) {
  return makeTracked(qvCHAR_CLASS, {sizes, dimensions}, Content::kUnset);
}

qvArray* qvCreateString(const char* text) {
  return tracked(ambrix::makeNarrowText(text == nullptr ? std::string_view() : text));
}

qvArray* qvCreateCellMatrix(std::size_t rows, std::size_t columns) {
  const std::size_t sizes[] = {rows, columns};
  return makeTracked(qvCELL_CLASS, sizes, Content::kZero);
}

void qvSetCell(qvArray* cell, std::size_t index, qvArray* value) {
  ambrix::setCell(*cell, index, value);
}
