// `ambrix dump`: the values of a variable.
#pragma once

#include <memory>
#include <string>

#include "ambrix/file.h"
#include "tool/content/values.h"
#include "tool/output/standard_output.h"

namespace ambrix::tool {

struct DumpOptions {
  std::string file;
  std::string variable;
  std::string records;
  std::string format;  // empty: what the output's name ends with, or a table
  std::string output;  // empty: standard output
  bool defuseFormulas = false;
  bool rawTimes = false;
};

/// Throws `UsageError` for records that are no range, and `ToolError` for those that are not there.
void runDump(Module& module, const DumpOptions& options, StandardOutput& output);

/// Records from the first to the one before the end.
struct RecordRange {
  std::size_t first = 0;
  std::size_t end = 0;
};

/// How values are written, one after the other in host order.
class DumpFormat {
 public:
  virtual ~DumpFormat() = default;
  virtual std::string begin() { return {}; }
  /// Appends one value to the text. `indices` are those within the record.
  virtual void append(std::string& text, std::size_t record,
                      const std::vector<std::size_t>& indices, const ValueView& value) = 0;
  virtual std::string end() { return {}; }
};

std::unique_ptr<DumpFormat> makeTableFormat(const Variable& variable, const RecordRange& range,
                                            bool colours);
/// `defuses`: texts that a spreadsheet would take for formulas get an apostrophe before them.
std::unique_ptr<DumpFormat> makeCsvFormat(const Variable& variable, bool defuses);
std::unique_ptr<DumpFormat> makeJsonFormat(const Variable& variable, const RecordRange& range);

}  // namespace ambrix::tool
