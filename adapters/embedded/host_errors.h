// The errors that the host itself raises.
#pragma once

namespace ambrix {

/// A size that is negative when taken as signed.
[[noreturn]] void raiseBadDimension();
/// Memory that overflows, exceeds the limit or cannot be had.
[[noreturn]] void raiseOutOfMemory();

}  // namespace ambrix
