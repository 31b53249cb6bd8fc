// A sequence of calls that a string of bytes stands for.
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>

namespace ambrix_fuzz {

/// What is worth handing to `runSequence`: enough bytes for about sixty calls.
inline constexpr std::size_t kSequenceBytes = 2048;
inline constexpr std::size_t kMostCalls = 80;

/// Starts from no open file and ends by unloading. A violation ends the process.
void runSequence(std::span<const std::uint8_t> bytes);

}  // namespace ambrix_fuzz
