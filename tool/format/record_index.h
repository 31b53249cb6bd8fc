// Whether a file can hold the records that it claims to hold.
#pragma once

#include "ambrix/file.h"
#include "tool/content/failure.h"

namespace ambrix::tool {

/// A count in a file that is not true.
class DamagedCounts : public ToolError {
 public:
  explicit DamagedCounts(const std::string& message) : ToolError("moreThanTheFile", message) {}
};

/// The records from the first on that a variable's index has room for. The library keeps room for
/// all records of a variable that is not sparse, and for the last one of any variable.
double countIndexedRecords(File& file, const Variable& variable);

/// Throws `DamagedCounts` when a variable's index has no room for that many records.
void requireIndexed(File& file, const Variable& variable, double records);

}  // namespace ambrix::tool
