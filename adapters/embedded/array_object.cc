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

#include "adapters/embedded/allocation.h"
#include "adapters/embedded/host_errors.h"
#include "ambrix/visit.h"

static_assert(std::is_standard_layout_v<qvArray>, "an array is found by its place on a list");

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

struct Shape {
  std::span<const std::size_t> sizes;  // without trailing 1s; may be fewer than two
  std::size_t dimensionCount = 0;
  std::size_t elementCount = 0;
  std::size_t bytes = 0;
};

/// The number of elements; 0 as soon as one size is, however large the others are.
std::size_t countElements(std::span<const std::size_t> sizes) {
  std::size_t count = sizes.empty() ? 0 : 1;
  bool tooMany = false;
  for (const std::size_t size : sizes) {
    if (size > PTRDIFF_MAX) raiseBadDimension();
    tooMany |= __builtin_mul_overflow(count, size, &count);
  }
  if (tooMany && std::ranges::find(sizes, 0U) == sizes.end()) raiseOutOfMemory();
  return tooMany ? 0 : count;
}

Shape shapeOf(qvClassID classId, std::span<const std::size_t> sizes) {
  Shape shape;
  shape.elementCount = countElements(sizes);
  if (__builtin_mul_overflow(shape.elementCount, elementBytes(classId), &shape.bytes)) {
    raiseOutOfMemory();
  }
  while (sizes.size() > 2 && sizes.back() == 1)
    sizes = sizes.first(sizes.size() - 1);
  shape.sizes = sizes;
  shape.dimensionCount = std::max<std::size_t>(sizes.size(), 2);
  return shape;
}

/// Sizes that are not given are 1, but no sizes at all make 0-by-0.
void storeSizes(qvArray& array, const Shape& shape) {
  const std::size_t missing = shape.sizes.empty() ? 0 : 1;
  std::size_t* const sizes = array.sizes();
  for (std::size_t i = 0; i < shape.dimensionCount; ++i)
    sizes[i] = i < shape.sizes.size() ? shape.sizes[i] : missing;
}

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
  storeSizes(*array, shape);
  return array;
}

}  // namespace

std::size_t elementBytes(qvClassID classId) noexcept {
  return static_cast<std::size_t>(classId) < kElementBytes.size() ? kElementBytes[classId] : 0;
}

qvArray* makeArray(qvClassID classId, std::span<const std::size_t> sizes, Content content) {
  if (elementBytes(classId) == 0) throw std::logic_error("no array can have this class");
  const Shape shape = shapeOf(classId, sizes);
  requireWithinLimit(shape.bytes);
  const bool zeroed = content == Content::kZero || classId == qvCELL_CLASS;
  const bool isInline = shape.bytes <= kMostInlineBytes;

  Head array = makeHead(classId, shape, isInline ? shape.bytes : 0);
  if (!isInline) {
    array->elements = zeroed ? allocateZeroed(shape.bytes) : allocate(shape.bytes);
    array->storage = Storage::kOwnBlock;
  } else if (shape.bytes != 0) {
    array->elements = behindSizes(*array);
    if (zeroed) std::memset(array->elements, 0, shape.bytes);
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
  const Shape shape = shapeOf(classId, sizes);
  if (shape.bytes != elements.size()) {
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

/// Puts the cells of an array in front of a chain of arrays.
Tracked* chainCells(const qvArray& array, Tracked* chain) noexcept {
  for (qvArray* const cell : array.cells()) {
    if (cell == nullptr) continue;
    cell->place.next = chain;
    chain = &cell->place;
  }
  return chain;
}

void releaseElements(qvArray& array) noexcept {
  if (array.storage == Storage::kOwnBlock) return release(array.elements);
  std::destroy_at(static_cast<Keeper*>(behindSizes(array)));
}

}  // namespace

void destroyArray(qvArray* array) noexcept {
  if (array == nullptr) return;
  TrackedList::remove(array->place);
  // Cells nest as deep as anyone likes: what is still to be freed is chained, not recursed into.
  Tracked* pending = &array->place;
  while (pending != nullptr) {
    auto* const next = reinterpret_cast<qvArray*>(pending);
    pending = next->place.next;
    if (next->classId == qvCELL_CLASS) pending = chainCells(*next, pending);
    if (next->storage != Storage::kInline) releaseElements(*next);
    release(next);
    countArray(-1);
  }
}

}  // namespace ambrix
