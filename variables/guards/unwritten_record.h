// Guard: an unwritten record of a variable whose records do not vary, in a file of the version 2
// format.
//
// Fault of 3.6.3, not of 3.9.1: the library fills the result with the memory before it. In files of
// the version 3 format it returns pad values. These functions return the same pad values.
#pragma once

#include "variables/hyperslab.h"

namespace TOLVEX::ambrix {

/// True if the library has the fault and the record is such a record.
bool mustFillUnwrittenRecord(const VariableOperation& variable,
                             const VariableDescription& description);

// Called in place of reading: they fill the result with the variable's pad value.

void fillRecord(const VariableOperation& variable, const VariableDescription& description,
                void* result);
/// The library checks the record, the indices and the hyperslab as if it read them.
void fillValue(const VariableOperation& variable, const VariableDescription& description,
               long record, const DimensionVector& indices, void* result);
void fillHyperslab(const VariableOperation& variable, const VariableDescription& description,
                   const LibraryHyperslab& slab, void* result);

}  // namespace TOLVEX::ambrix
