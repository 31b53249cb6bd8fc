#include "tool/output/text.h"

#include <fmt/format.h>

#include <algorithm>
#include <cstdlib>
#include <optional>

#include "adapters/catalogue/unicode.h"

namespace ambrix::tool {
namespace {

/// The bytes of the character that the text begins with: none when it is not valid UTF-8.
std::size_t characterLength(std::string_view text) {
  for (std::size_t length = 1; length <= std::min<std::size_t>(4, text.size()); ++length)
    if (catalogue::toUtf16(text.substr(0, length))) return length;
  return 0;
}

/// What could change more on a terminal than the place where it stands: control characters, those
/// that turn the direction of texts, and separators of lines.
bool isControl(char16_t unit) {
  return unit < 0x20 || (unit >= 0x7F && unit < 0xA0) || unit == 0x061C ||
         (unit >= 0x200E && unit <= 0x200F) || (unit >= 0x2028 && unit <= 0x202E) ||
         (unit >= 0x2066 && unit <= 0x2069);
}

bool isBlankControl(char16_t unit) {
  return unit == u'\n' || unit == u'\r' || unit == u'\t';
}

std::string escapeControl(char16_t unit) {
  switch (unit) {
    case '\n':
      return "\\n";
    case '\r':
      return "\\r";
    case '\t':
      return "\\t";
    default:
      return unit < 0x100 ? fmt::format("\\x{:02x}", static_cast<unsigned>(unit))
                          : fmt::format("\\u{:04x}", static_cast<unsigned>(unit));
  }
}

/// UTF-8 of the bytes, with escapes for the units that are not wanted.
std::string escapeUnits(std::string_view bytes, bool (*unwanted)(char16_t)) {
  std::string text = toUtf8(bytes);
  const std::u16string units = catalogue::toUtf16(text).value();
  if (std::ranges::none_of(units, unwanted)) return text;
  std::u16string escaped;
  for (const char16_t unit : units) {
    const std::string escape = unwanted(unit) ? escapeControl(unit) : "";
    escaped +=
        escape.empty() ? std::u16string(1, unit) : std::u16string(escape.begin(), escape.end());
  }
  return catalogue::toUtf8(escaped);
}

/// Combining marks take no column; the scripts of East Asia and pictures take two.
std::size_t unitWidth(char16_t unit) {
  if ((unit >= 0x0300 && unit < 0x0370) || (unit >= 0x200B && unit < 0x2010)) return 0;
  const bool wide = (unit >= 0x1100 && unit < 0x1160) || (unit >= 0x2E80 && unit < 0xA4D0) ||
                    (unit >= 0xAC00 && unit < 0xD7A4) || (unit >= 0xF900 && unit < 0xFB00) ||
                    (unit >= 0xFF00 && unit < 0xFF61);
  return wide ? 2 : 1;  // and both halves of a pair one each, which makes two
}

std::string pad(const std::string& text, std::size_t width, bool rightAligned) {
  const std::string blanks(width - displayWidth(text), ' ');
  return rightAligned ? blanks + text : text + blanks;
}

}  // namespace

std::string toUtf8(std::string_view bytes) {
  if (catalogue::toUtf16(bytes)) return std::string(bytes);
  std::string text;
  while (!bytes.empty()) {
    const std::size_t length = characterLength(bytes);
    const char16_t byte = static_cast<unsigned char>(bytes.front());
    text += length == 0 ? catalogue::toUtf8({&byte, 1}) : std::string(bytes.substr(0, length));
    bytes.remove_prefix(std::max<std::size_t>(length, 1));
  }
  return text;
}

std::string printable(std::string_view bytes) {
  return escapeUnits(bytes, isControl);
}

std::string printableLines(std::string_view bytes) {
  return escapeUnits(bytes, [](char16_t unit) { return isControl(unit) && !isBlankControl(unit); });
}

std::string_view trimmed(std::string_view bytes) {
  return bytes.substr(0, bytes.find_last_not_of(std::string_view(" \0", 2)) + 1);
}

std::size_t displayWidth(std::string_view utf8) {
  std::size_t width = 0;
  const std::u16string units = catalogue::toUtf16(utf8).value_or(std::u16string(utf8.size(), u'?'));
  for (const char16_t unit : units)
    width += unitWidth(unit);
  return width;
}

Style::Style(bool terminal) {
  const char* const noColour = std::getenv("NO_COLOR");
  colours_ = terminal && (noColour == nullptr || *noColour == '\0');
}

std::string Style::bold(const std::string& text) const {
  return colours_ ? "\033[1m" + text + "\033[0m" : text;
}

std::vector<std::size_t> TextTable::widths() const {
  std::vector<std::size_t> widths(columns_.size(), 0);
  for (const auto& row : rows_) {
    for (std::size_t i = 0; i < row.size(); ++i)
      widths[i] = std::max(widths[i], displayWidth(row[i]));
  }
  for (std::size_t i = 0; i < widths.size(); ++i) {
    if (widths[i] > 0) widths[i] = std::max(widths[i], displayWidth(columns_[i].heading));
  }
  return widths;
}

std::string TextTable::render(const Style& style) const {
  const std::vector<std::size_t> width = widths();
  const auto line = [&](const auto& cellOf) {
    std::string text;
    for (std::size_t i = 0; i < columns_.size(); ++i) {
      if (width[i] > 0) text += pad(cellOf(i), width[i], columns_[i].rightAligned) + "  ";
    }
    return std::string(trimmed(text));
  };
  std::string text = style.bold(line([&](std::size_t i) { return columns_[i].heading; })) + '\n';
  for (const auto& row : rows_)
    text += line([&](std::size_t i) { return row[i]; }) + '\n';
  return text;
}

}  // namespace ambrix::tool
