#include "fuzz/calls/values.h"

#include <algorithm>
#include <array>
#include <cstdio>
#include <cstring>
#include <iterator>
#include <limits>
#include <span>
#include <type_traits>
#include <vector>

#include "fuzz/calls/mode.h"

namespace ambrix_fuzz {
namespace {

using ambrix_test::CdfDatatype;
using ambrix_test::findCdfDatatype;
using ambrix_test::kCdfDatatypes;
using ambrix_test::kInt8;
using ambrix_test::kOtherDatatypes;
using ambrix_test::kTt2000;
using ambrix_test::lowerCaseName;

constexpr double kInfinity = std::numeric_limits<double>::infinity();

constexpr double kNumbers[] = {
    0.0,           1.0,           -1.0,
    2.0,           3.0,           5.0,
    0.5,           -0.5,          -1.9,
    9.0,           10.0,          11.0,
    12.0,          33.0,          51.0,
    100.0,         255.0,         65536.0,
    2147483646.0,  2147483647.0,  2147483648.0,
    -2147483648.0, -2147483649.0, 4294967295.0,
    4294967296.0,  4294967299.0,  0x1p53,
    0x1p62,        -0x1p62,       0x1.fffffffffffffp62,
    0x1p63,        -0x1p63,       1e19,
    1e300,         -1e31,         5e-324,
    kInfinity,     -kInfinity,    std::numeric_limits<double>::quiet_NaN(),
};

using Shape = std::vector<std::size_t>;
const Shape kShapes[] = {{1, 1},    {1, 1},    {0, 0},
                         {1, 0},    {0, 5},    {1, 2},
                         {2, 1},    {1, 3},    {3, 4},
                         {1, 7},    {10, 1},   {1, 11},
                         {2, 3},    {1, 70},   {2, 10},
                         {1, 1, 2}, {2, 3, 4}, {1, 257},
                         {2, 0},    {1, 1000}, {2, 1, 1, 1, 1, 1, 1, 1, 1, 1, 1, 3}};

constexpr char16_t kUnits[] = {u'a', u'b', u'v', u'V',   u'_',   u'0',   u'9',   u' ',   u'.', 0, 1,
                               0x7F, 0x80, 0xE9, 0x20AC, 0xD83D, 0xDE00, 0xD800, 0xFFFF, u'\n'};

template <typename T>
void fillNumbers(Choices& choices, Array& array) {
  for (T& element : array.mutableData<T>())
    element = static_cast<T>(anyNumber(choices));
}

void fillBytes(Choices& choices, Array& array) {
  const auto bytes = array.bytes();
  auto* place = const_cast<std::byte*>(bytes.data());
  const std::size_t some = std::min<std::size_t>(bytes.size(), 24);
  for (std::size_t i = 0; i < some; ++i)
    place[i] = static_cast<std::byte>(choices.byte());
}

void fill(Choices& choices, Array& array) {
  switch (array.classId()) {
    case ClassId::kCell:
      if (array.elementCount() > 0) array.setElement(0, Array::scalar(1.0));
      break;
    case ClassId::kLogical:
      for (bool& element : array.mutableData<bool>())
        element = choices.byte() % 2 == 0;
      break;
    case ClassId::kDouble:
      fillNumbers<double>(choices, array);
      break;
    default:
      fillBytes(choices, array);
  }
}

std::string shownNumber(double number) {
  std::array<char, 32> text{};
  std::snprintf(text.data(), text.size(), "%.17g", number);
  return text.data();
}

std::string shownElement(ArrayView array, std::size_t index) {
  return visit(array, ambrix::Overloaded{[](ArrayView) { return std::string("?"); },
                                         [&](std::span<const bool> values) {
                                           return std::string(values[index] ? "true" : "false");
                                         },
                                         [&]<typename T>(std::span<const T> values) {
                                           if constexpr (std::is_integral_v<T>)
                                             return std::to_string(values[index]);
                                           return shownNumber(static_cast<double>(values[index]));
                                         }});
}

}  // namespace

double anyNumber(Choices& choices) {
  const std::size_t at = choices.below(std::size(kNumbers) + 4);
  if (at < std::size(kNumbers)) return kNumbers[at];
  const std::uint64_t word = choices.word();
  double number = 0;
  std::memcpy(&number, &word, sizeof number);
  return number;
}

std::u16string anyText(Choices& choices) {
  constexpr std::size_t kLengths[] = {0, 1, 2, 3, 5, 8, 40, 255, 256, 257, 300, 5000};
  std::u16string text(choices.pick(kLengths), u'x');
  const std::size_t some = std::min<std::size_t>(text.size(), 8);
  for (std::size_t i = 0; i < some; ++i)
    text[i] = kUnits[choices.below(std::size(kUnits))];
  return text;
}

Array anyArray(Choices& choices) {
  if (choices.oneIn(4)) return Array::scalar(anyNumber(choices));
  if (choices.oneIn(4)) return Array::text(anyText(choices));
  Array array = Array::zeros(choices.pick(ambrix::kClassIds), choices.pick(kShapes));
  fill(choices, array);
  return array;
}

Array valuesOf(Choices& choices, ClassId classId, std::size_t count) {
  Array array = Array::zeros(classId, {1, count});
  fillBytes(choices, array);
  return array;
}

long anyDatatype(Choices& choices) {
  return choices.oneIn(8) ? choices.pick(kOtherDatatypes) : choices.pick(kDatatypeCodes);
}

ClassId classOfDatatype(long datatype) {
  const CdfDatatype* found = findCdfDatatype(datatype);
  if (found != nullptr) return found->classId;
  const bool isOther = std::ranges::find(kOtherDatatypes, datatype) != std::end(kOtherDatatypes);
  return isExtended() && isOther ? ClassId::kInt64 : ClassId::kUnknown;
}

std::size_t bytesOfDatatype(long datatype) {
  const CdfDatatype* found = findCdfDatatype(datatype);
  return found == nullptr ? 0 : found->bytes;
}

long datatypeOfName(std::string_view name) {
  const auto* found = std::ranges::find(kCdfDatatypes, name, lowerCaseName);
  if (found != std::end(kCdfDatatypes)) return found->code;
  if (name == "cdf_int8") return kInt8;
  return name == "cdf_time_tt2000" ? kTt2000 : 0;
}

bool isText(long datatype) {
  return classOfDatatype(datatype) == ClassId::kChar;
}

std::string shown(ArrayView array) {
  constexpr std::size_t kSome = 8;
  const std::size_t count = array.elementCount();
  if (array.classId() == ClassId::kChar && count <= 24) return '\'' + array.utf8() + '\'';
  std::string text;
  if (array.classId() != ClassId::kDouble) text = array.className() + std::string(" ");
  if (count == 1) return text + shownElement(array, 0);
  const auto sizes = array.size();
  for (std::size_t i = 0; i < sizes.size(); ++i)
    text += (i == 0 ? "" : "-by-") + std::to_string(sizes[i]);
  text += " [";
  for (std::size_t i = 0; i < std::min(count, kSome); ++i)
    text += (i == 0 ? "" : " ") + shownElement(array, i);
  return text + (count > kSome ? " ...]" : "]");
}

}  // namespace ambrix_fuzz
