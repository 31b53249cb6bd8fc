#include "tool/format/record_index.h"

#include <fmt/format.h>

#include <algorithm>

#include "tool/output/text.h"

namespace ambrix::tool {

double countIndexedRecords(CdfFile& file, const Variable& variable) {
  const double highest = file.number("getVarMaxAllocRecNum", {variable.number}) + 1;
  if (file.text("getVarSparseRecords", {variable.number}) != "NO_SPARSERECORDS") return highest;
  return std::min(highest, file.number("getVarAllocRecords", {variable.number}));
}

void requireIndexed(CdfFile& file, const Variable& variable, double records) {
  if (records <= 0) return;
  const double indexed = countIndexedRecords(file, variable);
  if (records <= indexed) return;
  throw DamagedCounts(
      fmt::format("variable \"{}\" claims records up to {}, but the file has room for {} only: it "
                  "is damaged",
                  printable(variable.name), records - 1, std::max(indexed, 0.0)));
}

}  // namespace ambrix::tool
