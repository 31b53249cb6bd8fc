#include "tool/dump/dump.h"

#include <fmt/format.h>

#include <charconv>
#include <filesystem>
#include <limits>
#include <optional>

#include "tool/content/failure.h"
#include "tool/content/open_file.h"
#include "tool/format/record_index.h"
#include "tool/output/progress.h"
#include "tool/output/text.h"

namespace ambrix::tool {
namespace {

std::optional<std::size_t> parseCount(std::string_view text) {
  std::size_t number = 0;
  const auto [end, error] = std::from_chars(text.begin(), text.end(), number);
  if (error != std::errc() || end != text.end()) return std::nullopt;
  return number;
}

std::size_t findVariable(File& file, const std::string& name) {
  if (const auto number = file.findVariable(name)) return *number;
  const auto number = parseCount(name);
  if (number && *number < file.variableCount()) return *number;
  throw ToolError("noSuchVariable", "there is no variable \"" + printable(name) +
                                        "\"; 'ambrix info' lists the variables");
}

std::size_t parseBound(std::string_view text, std::size_t whenLeftOut) {
  if (text.empty()) return whenLeftOut;
  const auto number = parseCount(text);
  if (!number) throw UsageError("--records: expected record numbers, as A:B, A:, :B or A");
  return *number;
}

std::string missingRecord(std::size_t records) {
  if (records == 0) return "the variable has no records";
  if (records == 1) return "the variable has only record 0";
  return fmt::format("the variable has records 0 to {}", records - 1);
}

/// "A:B" from A to B, both included; either may be left out. "A" is one record.
RecordRange parseRange(const std::string& text, std::size_t records) {
  if (text.empty()) return {0, records};
  const std::size_t colon = std::min(text.find(':'), text.size());
  const std::string_view last = std::string_view(text).substr(std::min(colon + 1, text.size()));
  const std::size_t first = parseBound(std::string_view(text).substr(0, colon), 0);
  const bool single = colon == text.size();
  const std::size_t lastRecord =
      single ? first : parseBound(last, std::numeric_limits<std::size_t>::max());
  if (lastRecord < first) throw UsageError("--records: the range ends before it begins");
  if (first >= records) {
    throw ToolError("noSuchRecord", missingRecord(records));
  }
  return {first, lastRecord < records ? lastRecord + 1 : records};
}

/// The indices within the record of the values of a slab, one after the other.
class IndexCounter {
 public:
  explicit IndexCounter(const Slab& slab)
      : slab_(slab), indices_(slab.start), record_(slab.firstRecord) {}

  [[nodiscard]] const std::vector<std::size_t>& indices() const { return indices_; }
  [[nodiscard]] std::size_t record() const { return record_; }

  void advance() {
    for (std::size_t i = 0; i < indices_.size(); ++i) {
      if (++indices_[i] < slab_.start[i] + slab_.count[i]) return;
      indices_[i] = slab_.start[i];
    }
    ++record_;
  }

 private:
  const Slab& slab_;
  std::vector<std::size_t> indices_;
  std::size_t record_;
};

void printSlab(Module& module, ArrayView data, const Variable& variable, const Slab& slab,
               TimeForm form, DumpFormat& format, StandardOutput& output) {
  constexpr std::size_t kWrittenTogether = 1 << 16;
  IndexCounter counter(slab);
  std::string text;
  eachValue(module, data, variable.datatype, variable.elements, form, [&](const ValueView& value) {
    format.append(text, counter.record(), counter.indices(), value);
    counter.advance();
    if (text.size() < kWrittenTogether) return;
    output.write(text);
    text.clear();
  });
  output.write(text);
}

/// "csv" of "x.csv"; empty where there is none.
std::string endingOf(const std::string& name) {
  const std::string ending = std::filesystem::path(name).extension();
  return ending.empty() ? ending : ending.substr(1);
}

std::unique_ptr<DumpFormat> makeFormat(const DumpOptions& options, const Variable& variable,
                                       const RecordRange& range, bool terminal) {
  const std::string name = options.format.empty() ? endingOf(options.output) : options.format;
  if (name == "csv") return makeCsvFormat(variable, options.defuseFormulas);
  if (options.defuseFormulas) throw UsageError("--defuse-formulas is for CSV only");
  if (name == "json") return makeJsonFormat(variable, range);
  return makeTableFormat(variable, range, terminal);
}

void requireSupported(const Variable& variable) {
  if (variable.supported) return;
  throw ToolError("unsupportedDatatype",
                  fmt::format("variable \"{}\" has the datatype {}, which is not supported",
                              printable(variable.name), datatypeName(variable.datatype)));
}

}  // namespace

void runDump(Module& module, const DumpOptions& options, StandardOutput& output) {
  File file = openFile(module, options.file);
  const Variable variable = file.variable(findVariable(file, options.variable));
  requireSupported(variable);
  const RecordRange range =
      parseRange(options.records, static_cast<std::size_t>(file.recordCount(variable)));
  requireIndexed(file, variable, static_cast<double>(range.end));
  const auto format = makeFormat(options, variable, range, output.isTerminal());
  SlabPlan plan(variable, range.first, range.end);
  Progress progress(printable(variable.name), (range.end - range.first) * variable.recordElements(),
                    errorIsTerminal() && !output.isTerminal());
  const TimeForm form = options.rawTimes ? TimeForm::kNumbers : TimeForm::kCalendar;
  output.write(format->begin());
  while (const auto slab = plan.next()) {
    const Array data = file.read(variable, *slab);
    printSlab(module, data, variable, *slab, form, *format, output);
    progress.advance(data.elementCount());
  }
  output.write(format->end());
  file.close();
}

}  // namespace ambrix::tool
