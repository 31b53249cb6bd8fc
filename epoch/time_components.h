// Calendar times as users give them: numbers in groups, one group for each time.
#pragma once

#include <cstddef>
#include <span>

#include "host/qv.h"

namespace TOLVEX::ambrix {

/// Number of groups; raises `badEpochVector` for a wrong number of elements and for a wrong class
/// alike.
std::size_t requireGroups(const qvArray* components, std::size_t size);

std::span<const double> componentsOf(const qvArray* times);

/// Reports an illegal time, unless a component is out of range in this or a later time: all
/// components are converted before the first time is computed. `later` are the components from this
/// time on.
[[noreturn]] void raiseIllegalTime(std::span<const double> later);

}  // namespace TOLVEX::ambrix
