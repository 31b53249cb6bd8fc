// Where every byte of arrays and scratch buffers comes from.
#pragma once

#include <cstddef>

namespace ambrix {

/// Raises "TOLVEX:host:outOfMemory" for a size beyond the limit on one array or buffer.
void requireWithinLimit(std::size_t bytes);

/// Aligned for any element, with unset content. Never null: raises "TOLVEX:host:outOfMemory".
void* allocate(std::size_t bytes);
/// The same with every byte zero; large memory comes zeroed from the system and costs nothing here.
void* allocateZeroed(std::size_t bytes);
/// Returns memory of either kind, or null.
void release(void* memory) noexcept;

/// What liveCounts() tells of arrays.
void countArray(int change) noexcept;

}  // namespace ambrix
