// Commands that differ only in constants: a row for each and one handler for the family.
#pragma once

#include <cstdint>

#include "gateway/arguments.h"
#include "gateway/command.h"
#include "gateway/library.h"
#include "gateway/open_file_registry.h"
#include "gateway/outputs.h"

namespace TOLVEX::ambrix {

/// A number that the library holds for a file.
struct FileNumber {
  long operation;  // GET_ or CONFIRM_
  long item;
  const char* routine;
};

/// A command (identifier) that returns a `FileNumber` as a double scalar.
template <const FileNumber& row>
void getFileNumber(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                   const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  long value = 0;
  callOnFile(row.routine, file, row.operation, row.item, &value);
  outputs[0] = makeDoubleScalar(value);
}

/// A number that is set for a file or one of its variables. A `SELECT_` item follows the selection
/// that the call begins with; the others follow a `PUT_`.
struct NumberSetting {
  long operation;  // PUT_ or SELECT_
  long item;
  const char* routine;
  const char* label;
  long refused;  // given to the library in place of a number beyond 32 bits
};

/// A command (identifier, number) without a result.
template <const NumberSetting& row>
void setFileNumber(int, qvArray*[], std::int32_t, const qvArray* arguments[], const CommandEntry*) {
  const CdfId file = getCdfIdArg(arguments[0]);
  const long value = libraryNumber(getLongScalarArg(arguments[1], row.label), row.refused);
  if constexpr (row.operation == SELECT_) {
    callOnFile(row.routine, file, row.item, value);
  } else {
    callOnFile(row.routine, file, row.operation, row.item, value);
  }
}

}  // namespace TOLVEX::ambrix
