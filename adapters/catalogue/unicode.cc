#include "adapters/catalogue/unicode.h"

#include <boost/nowide/utf/utf.hpp>
#include <iterator>

namespace ambrix::catalogue {
namespace {

namespace utf = boost::nowide::utf;
constexpr utf::code_point kReplacement = 0xFFFD;

bool isBroken(utf::code_point point) {
  return point == utf::illegal || point == utf::incomplete;
}

}  // namespace

std::string toUtf8(std::u16string_view units) {
  std::string bytes;
  bytes.reserve(units.size());
  const char16_t* next = units.data();
  const char16_t* const end = next + units.size();
  while (next != end) {
    const char16_t* const start = next;
    utf::code_point point = utf::utf_traits<char16_t>::decode(next, end);
    if (isBroken(point)) {
      next = start + 1;  // the unit behind an unpaired surrogate is a character of its own
      point = kReplacement;
    }
    utf::utf_traits<char>::encode(point, std::back_inserter(bytes));
  }
  return bytes;
}

std::optional<std::string> toValidUtf8(std::u16string_view units) {
  std::string bytes;
  bytes.reserve(units.size());
  const char16_t* next = units.data();
  const char16_t* const end = next + units.size();
  while (next != end) {
    const utf::code_point point = utf::utf_traits<char16_t>::decode(next, end);
    if (isBroken(point)) return std::nullopt;
    utf::utf_traits<char>::encode(point, std::back_inserter(bytes));
  }
  return bytes;
}

std::optional<std::u16string> toUtf16(std::string_view utf8) {
  std::u16string units;
  units.reserve(utf8.size());
  const char* next = utf8.data();
  const char* const end = next + utf8.size();
  while (next != end) {
    const utf::code_point point = utf::utf_traits<char>::decode(next, end);
    if (isBroken(point)) return std::nullopt;
    utf::utf_traits<char16_t>::encode(point, std::back_inserter(units));
  }
  return units;
}

}  // namespace ambrix::catalogue
