#include "tests/support/message_text.h"

#include <variant>

namespace ambrix_test {
namespace {

std::string valueText(const TOLVEX::ambrix::MessageArg& value) {
  if (const auto* number = std::get_if<std::int64_t>(&value)) return std::to_string(*number);
  if (const auto* text = std::get_if<std::string>(&value)) return '\'' + *text + '\'';
  const auto& wide = std::get<std::u16string>(value);
  return "u'" + std::string(wide.begin(), wide.end()) + '\'';
}

}  // namespace

std::string messageText(const TOLVEX::ambrix::MessageId& id) {
  std::string text = id.fullIdentifier() + '(';
  const char* separator = "";
  for (const auto& value : id.values) {
    text += separator + valueText(value);
    separator = ", ";
  }
  return text + ')';
}

}  // namespace ambrix_test
