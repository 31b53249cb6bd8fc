// The module's temporary buffers: `qvMalloc` and `qvFree`.
#pragma once

#include <cstddef>
#include <string_view>

#include "adapters/common/tracked.h"

namespace ambrix {

/// A zero-terminated copy that the module frees, or the end of the call. Raises
/// "TOLVEX:host:outOfMemory".
char* copyForModule(std::string_view bytes);

/// Frees a buffer that a call has left behind.
void reclaimScratch(Tracked& buffer) noexcept;

/// Memory for a buffer of so many bytes and the head in front of it, aligned for any object. Never
/// null: raises "TOLVEX:host:outOfMemory". Each host has its own.
void* allocateScratch(std::size_t headBytes, std::size_t bytes);
/// Returns it. Each host has its own.
void releaseScratch(void* memory) noexcept;

}  // namespace ambrix
