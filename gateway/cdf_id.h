// The CDF library's identifier of an open file, as the module carries it.
#pragma once

#include <cstdint>

namespace TOLVEX::ambrix {

/// Never dereferenced by the module. To the host it is a 1-by-1 uint64 array.
enum class CdfId : std::uint64_t {};

}  // namespace TOLVEX::ambrix
