#include "tool/json/text.h"

#include <algorithm>

#include "adapters/catalogue/unicode.h"
#include "tool/json/surrogates.h"

namespace ambrix::tool {
namespace {

constexpr int kMaxDepth = 512;

/// Watching the depth slows parsing down, so that is done only where there are enough brackets.
Json parseWatched(std::string_view text) {
  const auto opens = [](char c) { return c == '[' || c == '{'; };
  if (std::ranges::count_if(text, opens) <= kMaxDepth) return Json::parse(text);
  return Json::parse(text, [](int depth, Json::parse_event_t, const Json&) {
    if (depth > kMaxDepth) throw JsonError("nested too deeply");
    return true;
  });
}

}  // namespace

Json parseJson(std::string_view text) {
  if (text.find('\0') != text.npos) throw JsonError("a zero byte is not JSON");
  try {
    return parseWatched(hideSurrogates(text));
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
