// The functions by which the module looks at arrays, and where those that it makes come from.
#include "adapters/common/array_functions.h"
#include "adapters/common/call_frame.h"
#include "adapters/common/class_names.h"
#include "adapters/embedded/array_object.h"

qvArray* ambrix::makeInCall(qvClassID classId, std::span<const std::size_t> sizes,
                            Content content) {
  qvArray* const array = makeArray(classId, sizes, content);
  if (CallFrame* const frame = CallFrame::current()) frame->trackArray(*array);
  return array;
}

void ambrix::reclaimArray(Tracked& array) noexcept {
  destroyArray(static_cast<qvArray*>(&array));
}

namespace {

bool isCell(const qvArray* array) {
  return array->classId == qvCELL_CLASS;
}

}  // namespace

qvClassID qvGetClassID(const qvArray* array) {
  return array->classId;
}

const char* qvGetClassName(const qvArray* array) {
  return ambrix::nameOfClass(array->classId);
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
  return isCell(array) ? nullptr : array->elements;
}

void* qvGetData(qvArray* array) {
  return isCell(array) ? nullptr : array->elements;
}

const qvArray* qvGetCell(const qvArray* array, std::size_t index) {
  if (!isCell(array) || index >= array->elementCount) return nullptr;
  return array->cells()[index];
}

void qvSetCell(qvArray* cell, std::size_t index, qvArray* value) {
  ambrix::setCell(*cell, index, value);
}
