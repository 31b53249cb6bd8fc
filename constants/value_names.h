// What the library's settings are called, and the translation of the values that it returns.
#pragma once

#include <cstdint>
#include <map>
#include <string>

namespace TOLVEX::ambrix {

/// Value to name, in the library's own spelling. Built when the module is loaded.
using ValueNameTable = std::map<std::int64_t, std::string>;

extern const ValueNameTable FormatNames;
extern const ValueNameTable ChecksumNames;
extern const ValueNameTable ReadOnlyModeNames;
extern const ValueNameTable MajorityNames;
extern const ValueNameTable ValidateModeNames;
extern const ValueNameTable BackwardFileModeNames;
extern const ValueNameTable SparseRecordsNames;
extern const ValueNameTable ScopeNames;
extern const ValueNameTable CompressionNames;

/// The name of the value; raises `unrecognizedValue` with the value and `kindName` if it has none.
const std::string& lookupValueName(const ValueNameTable& table, std::int64_t value,
                                   const char* kindName);

}  // namespace TOLVEX::ambrix
