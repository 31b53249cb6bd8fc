// Making arrays from what is there already.
#include <algorithm>
#include <cstring>
#include <memory>
#include <stdexcept>
#include <utility>
#include <vector>

#include "adapters/common/narrow_text.h"
#include "adapters/embedded/array_object.h"

namespace ambrix {
namespace {

struct Destroy {
  void operator()(qvArray* array) const noexcept { destroyArray(array); }
};

qvArray* copyWithoutCells(const qvArray& array) {
  qvArray* const copy =
      makeArray(array.classId, {array.sizes(), array.dimensionCount}, Content::kUnset);
  if (array.classId == qvCELL_CLASS || array.elementCount == 0) return copy;
  std::memcpy(copy->elements, array.elements, array.elementCount * elementBytes(array.classId));
  return copy;
}

/// Texts are rows, but an empty one is 0-by-0.
qvArray* makeRowOfChars(std::size_t length) {
  const std::size_t sizes[] = {length == 0 ? 0U : 1U, length};
  return makeArray(qvCHAR_CLASS, sizes, Content::kUnset);
}

}  // namespace

qvArray* makeText(std::u16string_view units) {
  qvArray* const array = makeRowOfChars(units.size());
  std::ranges::copy(units, static_cast<char16_t*>(array->elements));
  return array;
}

qvArray* makeNarrowText(std::string_view bytes) {
  qvArray* const array = makeRowOfChars(bytes.size());
  widen(bytes, static_cast<char16_t*>(array->elements));
  return array;
}

qvArray*& cellAt(const qvArray& array, std::size_t index) {
  if (array.classId != qvCELL_CLASS) throw std::logic_error("the array is no cell array");
  if (index >= array.elementCount) throw std::out_of_range("the cell array has fewer elements");
  return array.cells()[index];
}

void setCell(const qvArray& array, std::size_t index, qvArray* value) {
  qvArray*& cell = cellAt(array, index);
  if (cell == value) return;
  if (value != nullptr) value->unlink();
  destroyArray(std::exchange(cell, value));
}

qvArray* copyArray(const qvArray& array) {
  std::unique_ptr<qvArray, Destroy> result(copyWithoutCells(array));
  std::vector<std::pair<const qvArray*, qvArray*>> pending{{&array, result.get()}};
  while (!pending.empty()) {
    const auto [source, copy] = pending.back();
    pending.pop_back();
    if (source->classId != qvCELL_CLASS) continue;
    for (std::size_t i = 0; i < source->elementCount; ++i) {
      const qvArray* const cell = source->cells()[i];
      if (cell == nullptr) continue;
      copy->cells()[i] = copyWithoutCells(*cell);
      pending.emplace_back(cell, copy->cells()[i]);
    }
  }
  return result.release();
}

}  // namespace ambrix
