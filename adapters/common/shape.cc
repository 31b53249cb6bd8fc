#include "adapters/common/shape.h"

#include <algorithm>
#include <cstdint>

#include "adapters/common/host_errors.h"

namespace ambrix {
namespace {

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

}  // namespace

std::size_t Shape::bytes(std::size_t elementBytes) const {
  std::size_t bytes = 0;
  if (__builtin_mul_overflow(elementCount, elementBytes, &bytes)) raiseOutOfMemory();
  return bytes;
}

Shape shapeOf(std::span<const std::size_t> sizes) {
  Shape shape;
  shape.elementCount = countElements(sizes);
  while (sizes.size() > 2 && sizes.back() == 1)
    sizes = sizes.first(sizes.size() - 1);
  shape.given = sizes;
  shape.dimensionCount = std::max<std::size_t>(sizes.size(), 2);
  return shape;
}

}  // namespace ambrix
