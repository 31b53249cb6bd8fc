// Guard: records that do not vary and were never written, in files of the format of version 2.
//
// Fault, in 3.6.3: reading such a record, the library fills the result with whatever lies in memory
// before it. In files of the newer format it gives pad values, which take their place here.
#pragma once

#include "variables/hyperslab.h"

namespace TOLVEX::ambrix {

/// Whether the library has the fault and would read such a record.
bool lacksItsRecord(const VariableOperation& variable, const VariableDescription& description);

// What takes the place of reading: the result is filled with the variable's pad value.

void fillRecord(const VariableOperation& variable, const VariableDescription& description,
                void* result);
/// The library checks the record, the indices and the hyperslab as if it read them.
void fillValue(const VariableOperation& variable, const VariableDescription& description,
               long record, const DimensionVector& indices, void* result);
void fillHyperslab(const VariableOperation& variable, const VariableDescription& description,
                   const LibraryHyperslab& slab, void* result);

}  // namespace TOLVEX::ambrix
