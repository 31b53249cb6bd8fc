// The errors that a host itself raises.
#pragma once

namespace ambrix {

/// A size that is negative when taken as signed: "TOLVEX:host:badDimension".
[[noreturn]] void raiseBadDimension();
/// Memory that overflows, exceeds a limit or cannot be had: "TOLVEX:host:outOfMemory".
[[noreturn]] void raiseOutOfMemory();
/// Something else than the errors of module and host, told by its own text:
/// "TOLVEX:host:unexpectedFailure".
[[noreturn]] void raiseUnexpected(const char* text);

}  // namespace ambrix
