// The array functions that the module calls.
#include <algorithm>
#include <span>
#include <stdexcept>
#include <string_view>

#include "adapters/octave/call_frame.h"
#include "adapters/octave/octave_array.h"

using ambrix::octave_host::CallFrame;
using ambrix::octave_host::Cells;
using ambrix::octave_host::Content;

namespace {

qvArray* make(qvClassID classId, std::span<const std::size_t> sizes, Content content) {
  CallFrame* const frame = CallFrame::current();
  if (frame == nullptr) throw std::logic_error("arrays are made only while the module is called");
  return frame->make(classId, sizes, content);
}

qvArray* makeNumbers(std::span<const std::size_t> sizes, qvClassID classId, qvComplexity complexity,
                     Content content) {
  if (classId < qvDOUBLE_CLASS) throw std::logic_error("a numeric array needs a numeric class");
  if (complexity != qvREAL) throw std::logic_error("the module makes no complex arrays");
  return make(classId, sizes, content);
}

bool hasClass(const qvArray* array, qvClassID classId) {
  return array->classId() == classId;
}

}  // namespace

qvClassID qvGetClassID(const qvArray* array) {
  return array->classId();
}
const char* qvGetClassName(const qvArray* array) {
  return array->className();
}

std::size_t qvGetNumberOfElements(const qvArray* array) {
  return array->elementCount();
}
std::size_t qvGetNumberOfDimensions(const qvArray* array) {
  return array->sizes().size();
}
const std::size_t* qvGetDimensions(const qvArray* array) {
  return array->sizes().data();
}

const void* qvGetReadOnlyData(const qvArray* array) {
  return array->data();
}
void* qvGetData(qvArray* array) {
  return array->data();
}

const bool* qvGetLogicals(const qvArray* array) {
  return hasClass(array, qvLOGICAL_CLASS) ? static_cast<const bool*>(array->data()) : nullptr;
}

const char16_t* qvGetReadOnlyChars(const qvArray* array) {
  return hasClass(array, qvCHAR_CLASS) ? static_cast<const char16_t*>(array->data()) : nullptr;
}
char16_t* qvGetChars(qvArray* array) {
  return hasClass(array, qvCHAR_CLASS) ? static_cast<char16_t*>(array->data()) : nullptr;
}

const qvArray* qvGetCell(const qvArray* array, std::size_t index) {
  const Cells* const cells = array->cells();
  return cells == nullptr || index >= cells->size() ? nullptr : (*cells)[index];
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
  qvArray* const array = make(qvDOUBLE_CLASS, sizes, Content::kUnset);
  *static_cast<double*>(array->data()) = value;
  return array;
}

qvArray* qvCreateLogicalArray(std::size_t dimensions, const std::size_t* sizes) {
  return make(qvLOGICAL_CLASS, {sizes, dimensions}, Content::kZero);
}

qvArray* qvCreateCharArray(std::size_t dimensions, const std::size_t* sizes) {
  return make(qvCHAR_CLASS, {sizes, dimensions}, Content::kUnset);
}

qvArray* qvCreateString(const char* text) {
  const std::string_view bytes = text == nullptr ? std::string_view() : text;
  const std::size_t sizes[] = {bytes.empty() ? 0U : 1U, bytes.size()};
  qvArray* const array = make(qvCHAR_CLASS, sizes, Content::kUnset);
  std::ranges::transform(bytes, qvGetChars(array),
                         [](char byte) { return static_cast<unsigned char>(byte); });
  return array;
}

qvArray* qvCreateCellMatrix(std::size_t rows, std::size_t columns) {
  const std::size_t sizes[] = {rows, columns};
  return make(qvCELL_CLASS, sizes, Content::kZero);
}

// The call owns both until it ends, so there is nothing to take over.
void qvSetCell(qvArray* cell, std::size_t index, qvArray* value) {
  Cells* const cells = cell->cells();
  if (cells == nullptr) throw std::logic_error("only cell arrays have cells");
  cells->at(index) = value;
}
