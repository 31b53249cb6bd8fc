// The functions by which the module looks at arrays, and where those that it makes come from.
#include <stdexcept>

#include "adapters/common/array_functions.h"
#include "adapters/common/call_frame.h"
#include "adapters/octave/array_object.h"

using ambrix::octave_host::Cells;

qvArray* ambrix::makeInCall(qvClassID classId, std::span<const std::size_t> sizes,
                            Content content) {
  CallFrame* const frame = CallFrame::current();
  if (frame == nullptr) throw std::logic_error("arrays are made only while the module is called");
  auto* const array = new qvArray(classId, sizes, content);
  frame->trackArray(*array);
  return array;
}

void ambrix::reclaimArray(Tracked& array) noexcept {
  delete static_cast<qvArray*>(&array);
}

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

const qvArray* qvGetCell(const qvArray* array, std::size_t index) {
  const Cells* const cells = array->cells();
  return cells == nullptr || index >= cells->size() ? nullptr : (*cells)[index];
}

// The call owns both until it ends, so there is nothing to take over.
void qvSetCell(qvArray* cell, std::size_t index, qvArray* value) {
  Cells* const cells = cell->cells();
  if (cells == nullptr) throw std::logic_error("only cell arrays have cells");
  cells->at(index) = value;
}
