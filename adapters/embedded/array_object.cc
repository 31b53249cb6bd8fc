#include "adapters/embedded/array_object.h"

#include <algorithm>
#include <array>
#include <cstdint>
#include <cstring>
#include <memory>
#include <new>
#include <stdexcept>
#include <type_traits>
#include <utility>

#include "adapters/common/shape.h"
#include "adapters/embedded/allocation.h"
#include "ambrix/visit.h"

namespace ambrix {
namespace {

constexpr std::size_t kMostInlineBytes = 256;
constexpr std::size_t kAlignment = alignof(std::max_align_t);

/// By class number.
constexpr auto kElementBytes = [] {
  std::array<std::size_t, qvUINT64_CLASS + 1> bytes{};
  const auto store = Overloaded{[](std::type_identity<ArrayView>) { return sizeof(qvArray*); },
                                []<typename T>(std::type_identity<T>) { return sizeof(T); }};
  for (const ClassId classId : kClassIds)
    bytes[static_cast<std::size_t>(classId)] = visitClass(classId, store);
  return bytes;
}();

std::size_t roundUp(std::size_t bytes) {
  return (bytes + kAlignment - 1) / kAlignment * kAlignment;
}

/// Where the elements lie when they are few, and what keeps them when they are borrowed.
void* behindSizes(qvArray& array) {
  const std::size_t headBytes = sizeof(qvArray) + array.dimensionCount * sizeof(std::size_t);
  return reinterpret_cast<std::byte*>(&array) + roundUp(headBytes);
}

using Keeper = std::shared_ptr<const void>;

struct ReleaseHead {
  void operator()(qvArray* array) const noexcept { release(array); }
};
using Head = std::unique_ptr<qvArray, ReleaseHead>;

/// An array without elements, and room behind it.
Head makeHead(qvClassID classId, const Shape& shape, std::size_t room) {
  const std::size_t headBytes =
      roundUp(sizeof(qvArray) + shape.dimensionCount * sizeof(std::size_t));
  Head array(new (allocate(headBytes + room)) qvArray);
  array->classId = classId;
  array->elementCount = shape.elementCount;
  array->dimensionCount = shape.dimensionCount;
  for (std::size_t i = 0; i < shape.dimensionCount; ++i)
    array->sizes()[i] = shape[i];
  return array;
}

}  // namespace

std::size_t elementBytes(qvClassID classId) noexcept {
  return static_cast<std::size_t>(classId) < kElementBytes.size() ? kElementBytes[classId] : 0;
}

qvArray* makeArray(qvClassID classId, std::span<const std::size_t> sizes, Content content) {
  if (elementBytes(classId) == 0) throw std::logic_error("no array can have this class");
  const Shape shape = shapeOf(sizes);
  const std::size_t bytes = shape.bytes(elementBytes(classId));
  requireWithinLimit(bytes);
  const bool zeroed = content == Content::kZero || classId == qvCELL_CLASS;
  const bool isInline = bytes <= kMostInlineBytes;

  Head array = makeHead(classId, shape, isInline ? bytes : 0);
  if (!isInline) {
    array->elements = zeroed ? allocateZeroed(bytes) : allocate(bytes);
    array->storage = Storage::kOwnBlock;
  } else if (bytes != 0) {
    array->elements = behindSizes(*array);
    if (zeroed) std::memset(array->elements, 0, bytes);
  }
  countArray(1);
  return array.release();
}

qvArray* borrowElements(qvClassID classId, std::span<const std::size_t> sizes,
                        std::span<const std::byte> elements, std::shared_ptr<const void> keeper) {
  const std::size_t each = elementBytes(classId);
  if (each == 0 || classId == qvCELL_CLASS) {
    throw std::invalid_argument("elements of this class can't be borrowed");
  }
  const Shape shape = shapeOf(sizes);
  if (shape.bytes(each) != elements.size()) {
    throw std::invalid_argument("the data do not fill the array");
  }
  if (reinterpret_cast<std::uintptr_t>(elements.data()) % each != 0) {
    throw std::invalid_argument("the data are not aligned");
  }
  Head array = makeHead(classId, shape, sizeof(Keeper));
  new (behindSizes(*array)) Keeper(std::move(keeper));
  array->elements = const_cast<std::byte*>(elements.data());  // `storage` keeps all from writing
  array->storage = Storage::kBorrowed;
  countArray(1);
  return array.release();
}

namespace {

void releaseElements(qvArray& array) noexcept {
  if (array.storage == Storage::kOwnBlock) return release(array.elements);
  std::destroy_at(static_cast<Keeper*>(behindSizes(array)));
}

void destroyWithoutCells(qvArray& array) noexcept {
  if (array.storage != Storage::kInline) releaseElements(array);
  std::destroy_at(&array);
  release(&array);
  countArray(-1);
}

}  // namespace

void destroyArray(qvArray* array) noexcept {
  if (array == nullptr) return;
  if (array->classId != qvCELL_CLASS) return destroyWithoutCells(*array);
  // Cells nest as deep as anyone likes: what is still to be freed is listed, not recursed into.
  array->unlink();
  TrackedList pending;
  pending.push_back(*array);
  while (!pending.empty()) {
    auto& next = static_cast<qvArray&>(pending.front());
    pending.pop_front();
    for (qvArray* const cell :
         next.classId == qvCELL_CLASS ? next.cells() : std::span<qvArray*>()) {
      if (cell != nullptr) pending.push_front(*cell);
    }
    destroyWithoutCells(next);
  }
}

}  // namespace ambrix
