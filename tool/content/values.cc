#include "tool/content/values.h"

#include <fmt/compile.h>
#include <fmt/format.h>

#include <array>
#include <cmath>
#include <span>
#include <stdexcept>
#include <type_traits>

#include "ambrix/texts.h"
#include "ambrix/times.h"
#include "ambrix/visit.h"
#include "tool/output/text.h"

namespace ambrix::tool {
namespace {

using Sink = std::function<void(const ValueView&)>;

template <typename T>
void formatNumber(T value, const Sink& sink) {
  if constexpr (std::is_floating_point_v<T>) {
    if (std::isnan(value)) return sink({"NaN", true});
    if (std::isinf(value)) return sink({value > 0 ? "Inf" : "-Inf", true});
  }
  std::array<char, 32> room;
  using Printed = std::conditional_t<std::is_floating_point_v<T>, T, std::int64_t>;
  const char* const end =
      fmt::format_to(room.data(), FMT_COMPILE("{}"), static_cast<Printed>(value));
  sink({{room.data(), static_cast<std::size_t>(end - room.data())}, false});
}

template <typename T>
void formatNumbers(std::span<const T> values, const Sink& sink) {
  for (const T value : values)
    formatNumber(value, sink);
}

void formatNumbers(ArrayView cells, const Sink& /*sink*/) {
  throw std::logic_error(std::string("no value is of class ") + cells.className());
}

/// What is no time is written as the numbers that it consists of.
void formatNoTime(std::span<const double> value, const Sink& sink) {
  if (value.size() == 1) return formatNumber(value.front(), sink);
  std::string numbers;
  for (const double number : value) {
    if (!numbers.empty()) numbers += ' ';
    formatNumber(number, [&](const ValueView& text) { numbers += text.text; });
  }
  sink({numbers, true});
}

void formatTimes(Module& module, ArrayView array, Datatype datatype, const Sink& sink) {
  const std::size_t elements = elementsPerValue(datatype, 1);
  auto numbers = array.data<double>();
  for (const std::string& text : timesAsText(module, array, datatype)) {
    if (text.empty()) {
      formatNoTime(numbers.first(elements), sink);
    } else {
      sink({text, true});
    }
    numbers = numbers.subspan(elements);
  }
}

}  // namespace

void eachValue(Module& module, ArrayView array, Datatype datatype, std::size_t elements,
               const Sink& sink) {
  if (isTimeType(datatype)) return formatTimes(module, array, datatype, sink);
  if (!isCharacterType(datatype)) {
    return visit(array, [&](auto numbers) { formatNumbers(numbers, sink); });
  }
  for (const std::string& text : textsOf(array, elements))
    sink({text, true});
}

std::vector<ValueText> formatValues(Module& module, ArrayView array, Datatype datatype,
                                    std::size_t elements) {
  std::vector<ValueText> values;
  eachValue(module, array, datatype, elements, [&](const ValueView& value) {
    values.push_back({std::string(value.text), value.isText});
  });
  return values;
}

std::string joinValues(const std::vector<ValueText>& values) {
  std::string line;
  for (const ValueText& value : values) {
    if (!line.empty()) line += ", ";
    line += value.isText ? printable(trimmed(value.text)) : value.text;
  }
  return line;
}

}  // namespace ambrix::tool
