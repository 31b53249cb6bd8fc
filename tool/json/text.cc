#include "tool/json/text.h"

#include "adapters/catalogue/unicode.h"
#include "tool/json/surrogates.h"

namespace ambrix::tool {
namespace {

constexpr int kMaxDepth = 512;

}  // namespace

Json parseJson(std::string_view text) {
  if (text.find('\0') != text.npos) throw JsonError("a zero byte is no JSON");
  const auto check = [](int depth, Json::parse_event_t, const Json&) {
    if (depth > kMaxDepth) throw JsonError("nested too deeply");
    return true;
  };
  try {
    return Json::parse(hideSurrogates(text), check);
  } catch (const Json::out_of_range&) {
    throw JsonRangeError("a number beyond the range of double");
  } catch (const Json::exception& error) {
    throw JsonError(error.what());
  }
}

std::u16string unitsOf(const Json& string) {
  if (!string.is_string()) throw JsonError("not a string");
  return showSurrogates(catalogue::toUtf16(string.get_ref<const std::string&>()).value());
}

}  // namespace ambrix::tool
