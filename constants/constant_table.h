// The names of the CDF library's constants as users give them, and the two commands over them.
#pragma once

#include <cstdint>
#include <map>
#include <string>

#include "gateway/command.h"

namespace TOLVEX::ambrix {

/// Upper-case name to value, in byte-wise order of the names. 57 entries, built when the module is
/// loaded.
extern const std::map<std::string, double> ConstantNameTable;

/// "getConstantNames" (): the names as a column of cells.
void getConstantNames(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                      const CommandEntry*);

/// "getConstantValue" (name in any case): a double scalar. Raises `unrecognizedConstantName` with
/// the name in the upper case of the current locale.
void getConstantValue(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                      const CommandEntry*);

}  // namespace TOLVEX::ambrix
