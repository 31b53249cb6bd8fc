// The module's temporary buffers.
#pragma once

#include <cstddef>

#include "adapters/embedded/tracked_list.h"

namespace ambrix {

/// A buffer that belongs to the call under way, if there is one. Raises "TOLVEX:host:outOfMemory".
void* makeScratch(std::size_t bytes);
/// Frees a buffer; null is fine.
void freeScratch(void* memory) noexcept;
/// Frees a buffer known by its place on a list.
void freeScratchAt(Tracked& place) noexcept;

}  // namespace ambrix
