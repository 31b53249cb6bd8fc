// Guards: what the library would compute with in 32 bits, divide by, or write beyond. All versions
// that were tried have these faults. What is refused here is refused with the library's own words
// for such a record, size or number of elements.
#pragma once

#include <cstddef>

#include "gateway/library_calls.h"
#include "variables/variable_description.h"

namespace TOLVEX::ambrix {

/// Records that the routines for whole records must not see: they would abort all access to the
/// file, or leave a file that cannot be opened. As the library's bad record number.
void requireRecordNumber(const VariableOperation& variable, long record);

/// The library counts records in 32 bits: one record has a number there and no count. Where records
/// do not vary that does no harm. As its bad record number.
void requireCountableRecord(const VariableOperation& variable,
                            const VariableDescription& description, long record);

/// Values of no elements, which only a damaged file has. As its bad number of elements.
void requireElements(const VariableOperation& variable, const VariableDescription& description);

/// The library counts the bytes of a record in 32 bits: descriptions that only a damaged file or a
/// variable too large to store has. As its bad dimension size or bad number of elements. Readers
/// and writers call this after all checks that are not the library's.
void requireUsableRecord(const VariableOperation& variable, const VariableDescription& description);

/// Some operations make the library divide by the bytes of a record of a single-file CDF: variables
/// for which they wrap around to zero, and no others. As its bad dimension size.
void requireDivisibleRecord(const VariableOperation& variable,
                            const VariableDescription& description);
/// The same for operations that know no description: the library is asked for one. When it fails to
/// tell, the operation itself will say why.
void requireDivisibleRecord(const VariableOperation& variable);

/// Moving `values` values to or from `bytes` bytes that are not enough. As its bad number of
/// elements.
void requireRoom(const VariableOperation& variable, const VariableDescription& description,
                 long values, std::size_t bytes);

}  // namespace TOLVEX::ambrix
