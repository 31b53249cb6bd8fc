// Values as a table for people and as comma-separated values.
#include "tool/output/text.h"

#include <fmt/format.h>

#include "tool/dump/dump.h"

namespace ambrix::tool {
namespace {

std::size_t digits(std::size_t largest) {
  return fmt::formatted_size("{}", largest);
}

void appendCount(std::string& text, std::size_t count) {
  const fmt::format_int digits(count);
  text.append(digits.data(), digits.size());
}

/// The count with blanks before it.
void appendRight(std::string& text, std::size_t count, std::size_t width) {
  const fmt::format_int digits(count);
  text.append(width - std::min(width, digits.size()), ' ');
  text.append(digits.data(), digits.size());
}

class TableFormat : public DumpFormat {
 public:
  TableFormat(const Variable& variable, const RecordRange& range, bool terminal)
      : variable_(variable), style_(terminal) {
    widths_.push_back(std::max<std::size_t>(digits(range.end), 6));
    for (const std::size_t size : variable.sizes)
      widths_.push_back(std::max<std::size_t>(digits(size), 2));
  }

  std::string begin() override {
    std::string heading = fmt::format("{:>{}}", "Record", widths_[0]);
    for (std::size_t i = 1; i < widths_.size(); ++i)
      heading += fmt::format("  {:>{}}", fmt::format("i{}", i), widths_[i]);
    return style_.bold(heading + "  " + printable(variable_.name)) + '\n';
  }

  void append(std::string& line, std::size_t record, const std::vector<std::size_t>& indices,
              const ValueView& value) override {
    appendRight(line, record, widths_[0]);
    for (std::size_t i = 0; i < indices.size(); ++i) {
      line += "  ";
      appendRight(line, indices[i], widths_[i + 1]);
    }
    line += "  ";
    if (value.isText) {
      line += printable(trimmed(value.text));
    } else {
      line += value.text;
    }
    line += '\n';
  }

 private:
  const Variable& variable_;
  Style style_;
  std::vector<std::size_t> widths_;
};

/// Whether a spreadsheet would take the text for a formula.
bool isFormula(std::string_view text) {
  return text.find_first_of("=+-@\t\r") == 0;
}

std::string csvCell(const std::string& text) {
  if (text.find_first_of(",\"\r\n") == std::string::npos) return text;
  std::string quoted = "\"";
  for (const char c : text)
    quoted += c == '"' ? std::string("\"\"") : std::string(1, c);
  return quoted + '"';
}

class CsvFormat : public DumpFormat {
 public:
  CsvFormat(const Variable& variable, bool defuses) : variable_(variable), defuses_(defuses) {}

  std::string begin() override {
    std::string heading = "record";
    for (std::size_t i = 1; i <= variable_.sizes.size(); ++i)
      heading += fmt::format(",i{}", i);
    return heading + ',' + textCell(variable_.name) + '\n';
  }

  void append(std::string& line, std::size_t record, const std::vector<std::size_t>& indices,
              const ValueView& value) override {
    appendCount(line, record);
    for (const std::size_t index : indices) {
      line += ',';
      appendCount(line, index);
    }
    line += ',';
    if (isCharacterType(variable_.datatype)) {
      line += textCell(trimmed(value.text));
    } else {
      line += value.text;
    }
    line += '\n';
  }

 private:
  [[nodiscard]] std::string textCell(std::string_view bytes) const {
    return csvCell((defuses_ && isFormula(bytes) ? "'" : "") + printableLines(bytes));
  }

  const Variable& variable_;
  bool defuses_;
};

}  // namespace

std::unique_ptr<DumpFormat> makeTableFormat(const Variable& variable, const RecordRange& range,
                                            bool colours) {
  return std::make_unique<TableFormat>(variable, range, colours);
}

std::unique_ptr<DumpFormat> makeCsvFormat(const Variable& variable, bool defuses) {
  return std::make_unique<CsvFormat>(variable, defuses);
}

}  // namespace ambrix::tool
