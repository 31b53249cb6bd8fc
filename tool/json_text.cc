#include "tool/json_text.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstdlib>

#include "adapters/catalogue/unicode.h"
#include "tool/json_scanner.h"

namespace ambrix::tool {
namespace {

/// std::from_chars cannot tell a number that is too large from one that rounds to zero.
template <typename T>
T parseFloating(std::string_view digits, T (*fallback)(const char*, char**)) {
  T value = 0;
  const auto [end, error] = std::from_chars(digits.begin(), digits.end(), value);
  if (error == std::errc::result_out_of_range) {
    value = fallback(std::string(digits).c_str(), nullptr);
  }
  if (!std::isfinite(value)) throw JsonError("a number beyond the range of its class");
  return value;
}

template <typename T>
T parseInteger(std::string_view digits) {
  T value = 0;
  const auto [end, error] = std::from_chars(digits.begin(), digits.end(), value);
  if (error != std::errc() || end != digits.end()) {
    throw JsonError("not an integer of its class: " + std::string(digits.substr(0, 40)));
  }
  return value;
}

char16_t parseUnit(std::string_view digits) {
  unsigned value = 0;
  std::from_chars(digits.begin(), digits.end(), value, 16);
  return static_cast<char16_t>(value);
}

char16_t simpleEscape(char kind) {
  switch (kind) {
    case 'b':
      return u'\b';
    case 'f':
      return u'\f';
    case 'n':
      return u'\n';
    case 'r':
      return u'\r';
    case 't':
      return u'\t';
    default:
      return static_cast<char16_t>(kind);  // a quote or a stroke stands for itself
  }
}

/// The units of a string's text without its quotes.
std::u16string decodeString(std::string_view text) {
  std::u16string units;
  while (!text.empty()) {
    const std::size_t plain = std::min(text.find('\\'), text.size());
    units += catalogue::toUtf16(text.substr(0, plain)).value();
    text.remove_prefix(plain);
    if (text.empty()) break;
    const bool coded = text[1] == 'u';
    units += coded ? parseUnit(text.substr(2, 4)) : simpleEscape(text[1]);
    text.remove_prefix(coded ? 6 : 2);
  }
  return units;
}

/// What follows a list's or an object's opening bracket.
std::string_view behindOpening(std::string_view source) {
  JsonScanner scanner(source.substr(1));
  scanner.skipBlanks();
  return scanner.rest();
}

/// What follows an item: the next one or the closing bracket.
std::string_view behindItem(JsonScanner& scanner) {
  scanner.skipBlanks();
  scanner.take(',');
  scanner.skipBlanks();
  return scanner.rest();
}

}  // namespace

JsonView JsonView::check(std::string_view text, bool& numbersInRange) {
  if (!catalogue::toUtf16(text)) throw JsonError("not valid UTF-8");
  JsonScanner scanner(text);
  scanner.skipBlanks();
  const JsonView value(scanner.takeValue());
  scanner.skipBlanks();
  if (!scanner.atEnd()) throw JsonError("something follows the JSON value");
  numbersInRange = scanner.numbersInRange();
  return value;
}

JsonKind JsonView::kind() const noexcept {
  switch (source_.front()) {
    case '{':
      return JsonKind::kObject;
    case '[':
      return JsonKind::kList;
    case '"':
      return JsonKind::kString;
    case 't':
      return JsonKind::kTrue;
    case 'f':
      return JsonKind::kFalse;
    case 'n':
      return JsonKind::kNull;
    default:
      return JsonKind::kNumber;
  }
}

std::u16string JsonView::string() const {
  if (kind() != JsonKind::kString) throw JsonError("not a string");
  return decodeString(source_.substr(1, source_.size() - 2));
}

double JsonView::toDouble() const {
  if (kind() != JsonKind::kNumber) throw JsonError("not a number");
  return parseFloating<double>(source_, std::strtod);
}

float JsonView::toSingle() const {
  if (kind() != JsonKind::kNumber) throw JsonError("not a number");
  return parseFloating<float>(source_, std::strtof);
}

std::int64_t JsonView::toInt64() const {
  return parseInteger<std::int64_t>(source_);
}

std::uint64_t JsonView::toUint64() const {
  return parseInteger<std::uint64_t>(source_ == "-0" ? "0" : source_);
}

bool JsonView::isCount() const noexcept {
  return source_.find_first_not_of("0123456789") == std::string_view::npos;
}

JsonItems::JsonItems(JsonView list) {
  if (list.kind() != JsonKind::kList) throw JsonError("not a list");
  rest_ = behindOpening(list.source_);
}

std::optional<JsonView> JsonItems::next() {
  if (rest_ == "]") return std::nullopt;
  JsonScanner scanner(rest_);
  const JsonView item(scanner.takeValue());
  rest_ = behindItem(scanner);
  return item;
}

JsonMembers::JsonMembers(JsonView object) {
  if (object.kind() != JsonKind::kObject) throw JsonError("not an object");
  rest_ = behindOpening(object.source_);
}

std::optional<JsonMembers::Member> JsonMembers::next() {
  if (rest_ == "}") return std::nullopt;
  JsonScanner scanner(rest_);
  const JsonView key(scanner.takeString());
  scanner.skipBlanks();
  scanner.expect(':');
  scanner.skipBlanks();
  const JsonView value(scanner.takeValue());
  rest_ = behindItem(scanner);
  return Member{key.string(), value};
}

std::optional<JsonView> findMember(JsonView object, std::u16string_view key) {
  std::optional<JsonView> found;
  JsonMembers members(object);
  while (const auto member = members.next()) {
    if (member->key != key) continue;
    if (found) throw JsonError("a name stands twice in an object");
    found = member->value;
  }
  return found;
}

}  // namespace ambrix::tool
