// What holds for all sequences of a run.
#pragma once

namespace ambrix_fuzz {

/// Whether the host offers extended datatypes.
bool isExtended();
void setExtended(bool extended);

}  // namespace ambrix_fuzz
