#include "tool/json/surrogates.h"

#include <algorithm>
#include <charconv>
#include <cstddef>

#include "adapters/catalogue/unicode.h"

namespace ambrix::tool {
namespace {

constexpr char16_t kFirstSurrogate = 0xD800;
constexpr char16_t kSurrogates = 0x800;
// The first halves of the characters that stand for surrogates: U+10F800 to U+10FBFF, and the rest.
constexpr char16_t kFirstHalf = 0xDBFE;
constexpr char16_t kLastHalf = 0xDBFF;
constexpr char16_t kSecondHalf = 0xDC00;
constexpr char16_t kHalves = 0x400;

constexpr std::size_t kEscapeLength = 6;  // of \uXXXX

bool isSurrogate(unsigned unit) {
  return unit >= kFirstSurrogate && unit < kFirstSurrogate + kSurrogates;
}

void appendHidden(std::string& json, unsigned surrogate) {
  const unsigned index = surrogate - kFirstSurrogate;
  appendEscape(json, kFirstHalf + index / kHalves);
  appendEscape(json, kSecondHalf + index % kHalves);
}

char16_t shown(char16_t half, char16_t secondHalf) {
  return static_cast<char16_t>(kFirstSurrogate + (half - kFirstHalf) * kHalves +
                               (secondHalf - kSecondHalf));
}

/// The unit of an escape that the text begins with; 0, which is no surrogate, for any other text.
unsigned escapedUnit(std::string_view text) {
  if (text.size() < kEscapeLength || !text.starts_with("\\u")) return 0;
  unsigned unit = 0;
  const char* const last = text.data() + kEscapeLength;
  return std::from_chars(text.data() + 2, last, unit, 16).ptr == last ? unit : 0;
}

/// How much of the text can be copied as it is.
std::size_t plainLength(std::string_view text) {
  const auto isSpecial = [](char c) { return c == '\\' || c == '\xF4'; };
  return static_cast<std::size_t>(std::ranges::find_if(text, isSpecial) - text.begin());
}

/// Replaces what the text begins with, a stroke or the first byte of a high character; returns how
/// much of the text that was.
std::size_t hideFirst(std::string& json, std::string_view text) {
  if (const unsigned unit = escapedUnit(text); isSurrogate(unit)) {
    appendHidden(json, unit);
    return kEscapeLength;
  }
  constexpr std::size_t kLongest = 4;  // bytes of a character
  const auto character = catalogue::toUtf16(text.substr(0, kLongest));
  if (text.front() != '\\' && character && character->front() >= kFirstHalf) {
    for (const char16_t unit : *character)
      appendHidden(json, unit);
    return kLongest;
  }
  const std::size_t length = text.front() == '\\' ? 2 : 1;  // an escaped stroke is none itself
  json += text.substr(0, length);
  return std::min(length, text.size());
}

}  // namespace

void appendEscape(std::string& json, unsigned unit) {
  constexpr char kDigits[] = "0123456789abcdef";
  json += "\\u";
  for (int shift = 12; shift >= 0; shift -= 4)
    json += kDigits[(unit >> shift) & 0xF];
}

std::string hideSurrogates(std::string_view json) {
  std::string hidden;
  hidden.reserve(json.size());
  while (true) {
    const std::size_t plain = plainLength(json);
    hidden += json.substr(0, plain);
    json.remove_prefix(plain);
    if (json.empty()) return hidden;
    json.remove_prefix(hideFirst(hidden, json));
  }
}

std::string showSurrogates(std::string_view json) {
  std::string text;
  while (!json.empty()) {
    const unsigned half = escapedUnit(json);
    const bool hidden = half == kFirstHalf || half == kLastHalf;
    if (hidden) {
      const unsigned second = escapedUnit(json.substr(kEscapeLength));
      appendEscape(text, shown(static_cast<char16_t>(half), static_cast<char16_t>(second)));
      json.remove_prefix(2 * kEscapeLength);
      continue;
    }
    const std::size_t length = json.front() == '\\' ? 2 : 1;
    text += json.substr(0, length);
    json.remove_prefix(length);
  }
  return text;
}

std::u16string showSurrogates(std::u16string_view units) {
  std::u16string text;
  text.reserve(units.size());
  for (std::size_t i = 0; i < units.size(); ++i) {
    const bool hidden = units[i] == kFirstHalf || units[i] == kLastHalf;
    text += hidden ? shown(units[i], units[i + 1]) : units[i];
    if (hidden) ++i;
  }
  return text;
}

}  // namespace ambrix::tool
