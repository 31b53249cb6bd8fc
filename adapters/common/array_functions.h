// What a host supplies for the functions by which the module makes arrays.
#pragma once

#include <cstddef>
#include <span>

#include "adapters/common/exported_interface.h"

namespace ambrix {

enum class Content { kZero, kUnset };

/// A new array that belongs to the call under way; cells are always unset. Raises the host's
/// errors; throws std::logic_error for a class that arrays cannot have. Each host has its own.
qvArray* makeInCall(qvClassID classId, std::span<const std::size_t> sizes, Content content);

}  // namespace ambrix
