// New arrays of Octave whose elements are not set.
#pragma once

#include <octave/oct.h>

#include <cstddef>
#include <memory>
#include <type_traits>

#include "adapters/common/large_pages.h"

namespace ambrix::octave_host {

template <typename Element, typename Allocator>
Allocator allocatorOf(const Array<Element, Allocator>&);

/// An array whose elements are unset. Octave's constructor by dimensions zeroes them, which the
/// module would only overwrite, but Octave also adopts a buffer that its allocator has given.
/// Throws std::bad_alloc.
template <typename OctaveArray>
OctaveArray makeUnsetArray(const dim_vector& dims) {
  using Allocator = decltype(allocatorOf(std::declval<OctaveArray>()));
  using Element = typename OctaveArray::element_type;
  static_assert(std::is_trivially_copyable_v<Element>);
  const auto count = static_cast<std::size_t>(dims.safe_numel());
  Allocator allocator;
  const auto release = [&](Element* memory) { allocator.deallocate(memory, count); };
  std::unique_ptr<Element, decltype(release)> memory(allocator.allocate(count), release);
  preferLargePages(memory.get(), count * sizeof(Element));
  Array<Element> array(memory.get(), dims, allocator);
  memory.release();
  return OctaveArray(array);
}

}  // namespace ambrix::octave_host
