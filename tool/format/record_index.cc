#include "tool/format/record_index.h"

#include <fmt/format.h>

#include <algorithm>

#include "tool/output/text.h"

namespace ambrix::tool {

double countIndexedRecords(File& file, const Variable& variable) {
  const auto number = static_cast<double>(variable.number);
  const double highest = file.number("getVarMaxAllocRecNum", {number}) + 1;
  if (file.sparseRecords(variable) != "NO_SPARSERECORDS") return highest;
  return std::min(highest, file.number("getVarAllocRecords", {number}));
}

void requireIndexed(File& file, const Variable& variable, double records) {
  if (records <= 0) return;
  const double indexed = countIndexedRecords(file, variable);
  if (records <= indexed) return;
  throw DamagedCounts(
      fmt::format("variable \"{}\" claims records up to {}, but the file has room only for {}: it "
                  "is damaged",
                  printable(variable.name), records - 1, std::max(indexed, 0.0)));
}

}  // namespace ambrix::tool
