// The library's two routines for `CDF_TIME_TT2000`.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>

namespace TOLVEX::ambrix {

/// Year, month, day, hour, minute, second, millisecond, microsecond, nanosecond.
inline constexpr std::size_t kTt2000Components = 9;
using Tt2000Components = std::array<double, kTt2000Components>;

/// What the library answers for a time that does not exist.
inline constexpr std::int64_t kIllegalTt2000 = INT64_MIN + 3;

/// The library reads tables by the month and does not check it: it must be from 0 to 12.
std::int64_t tt2000OfComponents(const Tt2000Components& components);

Tt2000Components componentsOfTt2000(std::int64_t time);

}  // namespace TOLVEX::ambrix
