#include "adapters/catalogue/message_catalogue.h"

#include <cstddef>
#include <string_view>
#include <vector>

#include "adapters/catalogue/message_texts.h"
#include "adapters/catalogue/unicode.h"

namespace ambrix::catalogue {
namespace {

using TOLVEX::ambrix::MessageArg;
using TOLVEX::ambrix::MessageId;

std::string valueText(const MessageArg& value) {
  if (const auto* integer = std::get_if<std::int64_t>(&value)) return std::to_string(*integer);
  if (const auto* narrow = std::get_if<std::string>(&value)) return *narrow;
  return toUtf8(std::get<std::u16string>(value));
}

std::string valueText(const std::vector<MessageArg>& values, std::size_t index) {
  return index < values.size() ? valueText(values[index]) : "?";
}

/// Whether the text has a placeholder, {1} to {9}, at this position.
bool isPlaceholder(std::string_view text, std::size_t at) {
  return at + 2 < text.size() && text[at] == '{' && text[at + 1] >= '1' && text[at + 1] <= '9' &&
         text[at + 2] == '}';
}

std::string fillIn(std::string_view text, const std::vector<MessageArg>& values) {
  std::string result;
  for (std::size_t brace = text.find('{'); brace != text.npos; brace = text.find('{')) {
    const bool isValue = isPlaceholder(text, brace);
    result += text.substr(0, isValue ? brace : brace + 1);
    if (isValue) result += valueText(values, static_cast<std::size_t>(text[brace + 1] - '1'));
    text.remove_prefix(brace + (isValue ? 3 : 1));
  }
  return result.append(text);
}

std::string listValues(const MessageId& id) {
  std::string result = id.fullIdentifier();
  const char* separator = ": ";
  for (const MessageArg& value : id.values) {
    result += separator + valueText(value);
    separator = ", ";
  }
  return result;
}

}  // namespace

std::string messageText(const MessageId& id) {
  const std::string_view text = findText(id.component, id.identifier);
  return text.empty() ? listValues(id) : fillIn(text, id.values);
}

}  // namespace ambrix::catalogue
