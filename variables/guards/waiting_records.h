// What the library must have done with the records of a variable before others are read.
#pragma once

#include "gateway/cdf_id.h"

namespace TOLVEX::ambrix {

/// Reading a record that a compressed sparse variable does not have, the library fills in all up to
/// the next one that still waits to be written, however few were asked for. Has it write such
/// records first, so that it counts rightly. Raises `libraryFailure` with the routine.
void writeWaitingRecords(CdfId file, long variable, const char* routine);

}  // namespace TOLVEX::ambrix
