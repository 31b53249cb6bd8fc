#include <algorithm>
#include <array>
#include <charconv>
#include <cmath>
#include <span>
#include <type_traits>
#include <utility>

#include "adapters/catalogue/unicode.h"
#include "ambrix/visit.h"
#include "tool/json/surrogates.h"
#include "tool/json/value.h"
#include "tool/output/text.h"

namespace ambrix::tool {
namespace {

void appendUnit(std::string& json, char16_t unit) {
  if (unit < 0x20 || unit > 0x7E) return appendEscape(json, unit);
  if (unit == u'"' || unit == u'\\') json += '\\';
  json += static_cast<char>(unit);
}

template <typename T>
void appendDigits(std::string& json, T value) {
  std::array<char, 32> digits;
  json.append(digits.data(), std::to_chars(digits.begin(), digits.end(), value).ptr);
}

template <typename T>
void appendElement(std::string& json, T value) {
  if constexpr (std::is_same_v<T, bool>) {
    json += value ? "true" : "false";
  } else if constexpr (std::is_integral_v<T>) {
    appendDigits(json, value);
  } else if (!std::isfinite(value)) {
    json += std::isnan(value) ? "\"NaN\"" : value > 0 ? "\"Inf\"" : "\"-Inf\"";
  } else {
    appendDigits(json, static_cast<double>(value));  // what readers that know only doubles expect
    if (value == 0 && std::signbit(value)) json += ".0";  // many readers take -0 for 0
  }
}

template <typename T>
void appendElements(std::string& json, std::span<const T> values) {
  json += '[';
  const char* separator = "";
  for (const T value : values) {
    json += std::exchange(separator, ",");
    appendElement(json, value);
  }
  json += ']';
}

void appendElements(std::string& json, std::span<const char16_t> units) {
  appendString(json, {units.data(), units.size()});
}

void appendElements(std::string& json, ArrayView array) {
  json += '[';
  for (std::size_t index = 0; index < array.elementCount(); ++index) {
    if (index > 0) json += ',';
    const ArrayView element = array.element(index);
    appendValue(json, element ? element : Array::zeros(ClassId::kDouble, {0, 0}));
  }
  json += ']';
}

/// UTF-16 of a text in which every byte outside valid UTF-8 is the character of its number.
std::u16string decodeLeniently(std::string_view text) {
  return catalogue::toUtf16(toUtf8(text)).value();
}

}  // namespace

void appendValue(std::string& json, ArrayView array) {
  json += R"({"class":")";
  json += array.className();
  json += R"(","size":[)";
  const char* separator = "";
  for (const std::size_t size : array.size()) {
    json += std::exchange(separator, ",");
    appendDigits(json, size);
  }
  json += R"(],"data":)";
  visit(array, [&](auto elements) { appendElements(json, elements); });
  json += '}';
}

void appendString(std::string& json, std::u16string_view units) {
  json += '"';
  for (const char16_t unit : units)
    appendUnit(json, unit);
  json += '"';
}

void appendBytes(std::string& json, std::string_view bytes) {
  json += '"';
  for (const char byte : bytes)
    appendUnit(json, static_cast<unsigned char>(byte));
  json += '"';
}

void appendMessage(std::string& json, std::string_view text) {
  const auto units = catalogue::toUtf16(text);
  appendString(json, units ? *units : decodeLeniently(text));
}

}  // namespace ambrix::tool
