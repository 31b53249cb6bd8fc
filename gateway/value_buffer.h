// The byte buffer that receives values whose number and datatype are known only at run time.
#pragma once

#include <vector>

#include "gateway/scratch.h"

namespace TOLVEX::ambrix {

/// Its memory is the host's, so that the host's limits hold for it.
using ValueBuffer = std::vector<unsigned char, HostAllocator>;

/// Resizes to hold `count` values of a CDF datatype; new bytes are zero. Character data get one
/// byte more, for a terminator; an unsupported datatype empties the buffer.
void resizeValueBuffer(ValueBuffer& buffer, long datatype, long count);

}  // namespace TOLVEX::ambrix
