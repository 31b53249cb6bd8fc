// Guard: records of compressed sparse variables that wait in memory to be written.
//
// Fault, in 3.6.3 and 3.9.1: when the library reads a whole record that such a variable does not
// have, and none that is stored follows, it fills in all records up to the first one that waits,
// however few were asked for: beyond the result, or, when parts of records are read or written,
// beyond its own buffer of one record. Only records that were put since the file was opened wait.
#pragma once

#include <cstddef>
#include <cstring>

#include "gateway/scratch.h"
#include "gateway/sizes.h"
#include "variables/hyperslab.h"

namespace TOLVEX::ambrix {

/// Bytes that the library may write when it reads whole records, if they may be more than those of
/// the records; else 0. Has the library write the waiting records when that would be too many.
std::size_t roomForWaitingRecords(const VariableOperation& variable,
                                  const VariableDescription& description,
                                  const RecordRange& records);

/// Has the library write the waiting records if one of these would be filled in up to them.
void writeWaitingRecords(const VariableOperation& variable, const VariableDescription& description,
                         const RecordRange& records);

/// Reads whole records into the result; with room behind it where the library may need it.
template <typename Read>
void readWholeRecords(const VariableOperation& variable, const VariableDescription& description,
                      const RecordRange& records, void* result, const Read& read) {
  const std::size_t room = roomForWaitingRecords(variable, description, records);
  if (room == 0) return read(result);
  const ScratchBuffer roomy(room);
  read(roomy.data());
  std::memcpy(result, roomy.data(),
              saturatedProduct({records.count, description.storedBytesPerRecord()}));
}

}  // namespace TOLVEX::ambrix
