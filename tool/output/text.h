// Texts for people.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

namespace ambrix::tool {

/// The bytes as UTF-8: what is not UTF-8 is taken byte by byte as the characters of those numbers.
std::string toUtf8(std::string_view bytes);
/// The same on one line: control characters, and those that turn the direction of texts, become
/// escapes such as \n, \x1b and \u202e.
std::string printable(std::string_view bytes);
/// The same, but tabs and the ends of lines stay.
std::string printableLines(std::string_view bytes);
/// Without the blanks and zero bytes at the end.
std::string_view trimmed(std::string_view bytes);
/// The columns that a UTF-8 text takes on a terminal.
std::size_t displayWidth(std::string_view utf8);

/// Bold text where that is wanted, for a terminal whose user has not set NO_COLOR.
class Style {
 public:
  explicit Style(bool terminal);
  [[nodiscard]] std::string bold(const std::string& text) const;

 private:
  bool colours_;
};

/// Rows of cells in columns, under a heading. Columns that hold nothing are left out.
class TextTable {
 public:
  struct Column {
    std::string heading;
    bool rightAligned = false;
  };
  explicit TextTable(std::vector<Column> columns) : columns_(std::move(columns)) {}

  void addRow(std::vector<std::string> cells) { rows_.push_back(std::move(cells)); }
  [[nodiscard]] std::string render(const Style& style) const;

 private:
  [[nodiscard]] std::vector<std::size_t> widths() const;

  std::vector<Column> columns_;
  std::vector<std::vector<std::string>> rows_;
};

}  // namespace ambrix::tool
