// The slots into which a module puts its results.
#pragma once

#include <algorithm>
#include <array>
#include <cstddef>
#include <span>

#include "host/qv.h"

namespace ambrix {

/// Room for the results of any command: modules fill their slots without asking how many are
/// wanted.
inline constexpr std::size_t kSlots = 16;
using Slots = std::array<qvArray*, kSlots>;

/// The results: what is in front of the first empty slot.
inline std::span<qvArray* const> resultsIn(const Slots& slots) {
  return {slots.begin(), std::ranges::find(slots, nullptr)};
}

}  // namespace ambrix
