// The texts of an object's members, found without reading what stands in them.
#include <algorithm>
#include <cstddef>
#include <optional>

#include "adapters/catalogue/unicode.h"
#include "tool/json/surrogates.h"
#include "tool/json/text.h"

namespace ambrix::tool {
namespace {

constexpr char kBlanks[] = " \t\r\n";

/// Where the string ends that begins there.
std::size_t endOfString(std::string_view json, std::size_t begin) {
  std::size_t end = json.find_first_of("\"\\", begin + 1);
  while (end != json.npos && json[end] == '\\')
    end = json.find_first_of("\"\\", end + 2);
  return end == json.npos ? json.size() : end + 1;
}

/// Where the value ends that begins there: before the comma, the colon or the bracket behind it.
std::size_t endOfValue(std::string_view json, std::size_t begin) {
  std::size_t depth = 0;
  for (std::size_t at = begin; at < json.size(); ++at) {
    const char c = json[at];
    if (c == '"') at = endOfString(json, at) - 1;
    if (c == '[' || c == '{') ++depth;
    if (depth == 0 && (c == ',' || c == ':' || c == '}' || c == ']')) return at;
    if (c == ']' || c == '}') --depth;
  }
  return json.size();
}

std::string_view withoutBlanks(std::string_view text) {
  text.remove_prefix(std::min(text.find_first_not_of(kBlanks), text.size()));
  return text.substr(0, text.find_last_not_of(kBlanks) + 1);
}

/// The parsed value of a text, unless it is no JSON.
std::optional<Json> parsed(std::string_view text) try {
  return parseJson(text);
} catch (const JsonError&) {
  return std::nullopt;
}

/// The same JSON in ASCII on one line: outside strings, control characters are blanks.
std::string toAsciiLine(std::string_view json) {
  std::string line;
  const std::u16string units = catalogue::toUtf16(json).value();
  for (const char16_t unit : units) {
    if (unit > 0x7E) {
      appendEscape(line, unit);
    } else {
      line += unit < ' ' ? ' ' : static_cast<char>(unit);
    }
  }
  return line;
}

}  // namespace

std::string memberText(std::string_view object, std::string_view name) {
  std::string_view found;
  const std::size_t first = object.find_first_not_of(kBlanks);
  for (std::size_t at = first; at < object.size() && object[first] == '{';) {
    const std::size_t colon = endOfValue(object, at + 1);
    const std::size_t end = endOfValue(object, colon + 1);
    const auto key = parsed(object.substr(at + 1, colon - at - 1));
    if (key && *key == Json(name) && end > colon) found = object.substr(colon + 1, end - colon - 1);
    at = end;
  }
  return parsed(found) ? toAsciiLine(withoutBlanks(found)) : "";
}

}  // namespace ambrix::tool
