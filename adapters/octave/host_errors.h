// The errors that the host itself raises.
#pragma once

namespace ambrix::octave_host {

/// A size that is negative when taken as signed.
[[noreturn]] void raiseBadDimension();
/// Memory that overflows or cannot be had.
[[noreturn]] void raiseOutOfMemory();
/// Something else than the errors of module, host and Octave, told by its own text.
[[noreturn]] void raiseUnexpected(const char* text);

}  // namespace ambrix::octave_host
