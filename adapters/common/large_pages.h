// Memory in large pages, which cost a small fraction of small ones: filling new memory is mostly a
// matter of the system providing it, page by page.
#pragma once

#include <cstddef>

namespace ambrix {

/// The size of a large page, and the least memory that one can back. From there on they pay:
/// bench/large_pages.cc measures it.
inline constexpr std::size_t kLargePage = std::size_t{2} << 20U;

/// Asks the system to back memory that nobody has touched yet with large pages, where it holds a
/// whole one. What lies around whole ones is left in small pages, so that no more memory is used
/// than was asked for.
void preferLargePages(void* memory, std::size_t bytes) noexcept;

}  // namespace ambrix
