#include "tool/json_text.h"

#include <cmath>

#include "adapters/catalogue/unicode.h"
#include "tool/surrogates.h"

namespace ambrix::tool {
namespace {

constexpr int kMaxDepth = 512;

bool isInRange(const Json& value) {
  return !value.is_number_float() || std::isfinite(value.get<double>());
}

}  // namespace

Json parseJson(std::string_view text, bool& numbersInRange) {
  if (text.find('\0') != text.npos) throw JsonError("a zero byte is no JSON");
  numbersInRange = true;
  const auto check = [&](int depth, Json::parse_event_t, const Json& value) {
    if (depth > kMaxDepth) throw JsonError("nested too deeply");
    numbersInRange = numbersInRange && isInRange(value);
    return true;
  };
  try {
    return Json::parse(hideSurrogates(text), check);
  } catch (const Json::exception& error) {
    throw JsonError(error.what());
  }
}

std::u16string unitsOf(const Json& string) {
  if (!string.is_string()) throw JsonError("not a string");
  return showSurrogates(catalogue::toUtf16(string.get_ref<const std::string&>()).value());
}

std::string toAscii(const Json& value) {
  constexpr int kOneLine = -1;
  return showSurrogates(nlohmann::json(value).dump(kOneLine, ' ', true));
}

}  // namespace ambrix::tool
