// Commands that differ only in constants: a row for each and one handler for the family.
#pragma once

#include <cstdint>

#include "gateway/command.h"
#include "gateway/library_calls.h"
#include "gateway/open_file_registry.h"
#include "gateway/outputs.h"

namespace TOLVEX::ambrix {

/// A number that the library holds for a file.
struct FileProperty {
  long operation;  // GET_ or CONFIRM_
  long item;
  const char* routine;
};

/// A command (identifier) that returns a `FileProperty` as a double scalar.
template <const FileProperty& row>
void getFileProperty(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  long value = 0;
  callOnFile(row.routine, file, row.operation, row.item, &value);
  outputs[0] = makeDoubleScalar(value);
}

}  // namespace TOLVEX::ambrix
