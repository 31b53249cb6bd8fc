#include "tool/content/values.h"

#include <fmt/format.h>

#include <cmath>
#include <span>
#include <stdexcept>
#include <utility>

#include "ambrix/texts.h"
#include "ambrix/times.h"
#include "ambrix/visit.h"
#include "tool/output/text.h"

namespace ambrix::tool {
namespace {

template <typename T>
ValueText formatNumber(T value) {
  if constexpr (std::is_floating_point_v<T>) {
    if (std::isnan(value)) return {"NaN", true};
    if (std::isinf(value)) return {value > 0 ? "Inf" : "-Inf", true};
    return {fmt::format("{}", value), false};
  } else {
    return {fmt::format("{}", static_cast<std::int64_t>(value)), false};
  }
}

template <typename T>
std::vector<ValueText> formatNumbers(std::span<const T> values) {
  std::vector<ValueText> texts;
  texts.reserve(values.size());
  for (const T value : values)
    texts.push_back(formatNumber(value));
  return texts;
}

/// What is no time is written as the numbers that it consists of.
ValueText formatNoTime(std::span<const double> value) {
  if (value.size() == 1) return formatNumber(value.front());
  return {formatNumber(value[0]).text + ' ' + formatNumber(value[1]).text, true};
}

std::vector<ValueText> formatTimes(Module& module, ArrayView array, Datatype datatype) {
  const std::size_t elements = elementsPerValue(datatype, 1);
  std::vector<ValueText> values;
  for (std::string& text : timesAsText(module, array, datatype)) {
    const auto own = array.data<double>().subspan(elements * values.size(), elements);
    values.push_back(text.empty() ? formatNoTime(own) : ValueText{std::move(text), true});
  }
  return values;
}

std::vector<ValueText> formatTexts(ArrayView array, std::size_t length) {
  std::vector<ValueText> values;
  for (std::string& text : textsOf(array, length))
    values.push_back({std::move(text), true});
  return values;
}

std::vector<ValueText> formatNumbers(ArrayView cells) {
  throw std::logic_error(std::string("no value is of class ") + cells.className());
}

}  // namespace

std::vector<ValueText> formatValues(Module& module, ArrayView array, Datatype datatype,
                                    std::size_t elements) {
  if (isCharacterType(datatype)) return formatTexts(array, elements);
  if (isTimeType(datatype)) return formatTimes(module, array, datatype);
  return visit(array, [](auto numbers) { return formatNumbers(numbers); });
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
