// Records that do not vary and were never written.
#pragma once

#include "gateway/cdf_id.h"
#include "variables/hyperslab.h"
#include "variables/variable_description.h"

namespace TOLVEX::ambrix {

/// Whether it is such a record, in a file of the format of version 2.7. CDF 3.6.3 fills results
/// with whatever lies in memory before them when it reads one.
bool lacksItsRecord(CdfId file, long number, const VariableDescription& variable,
                    const char* routine);

// What the library does elsewhere: fills results with the variable's pad value.

void fillRecord(CdfId file, long number, const VariableDescription& variable, void* buffer,
                const char* routine);
/// The library checks the record, the indices and the hyperslab as if it read them.
void fillValue(CdfId file, long number, const VariableDescription& variable, long record,
               const DimensionVector& indices, void* buffer, const char* routine);
void fillHyperslab(CdfId file, long number, const VariableDescription& variable,
                   const LibraryHyperslab& slab, void* buffer, const char* routine);

}  // namespace TOLVEX::ambrix
