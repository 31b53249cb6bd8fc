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

/// A time as the numbers that it consists of.
template <typename T>
void formatRawTime(std::span<const T> value, const Sink& sink) {
  if (value.size() == 1) return formatNumber(value.front(), sink);
  std::string numbers;
  for (const T number : value) {
    if (!numbers.empty()) numbers += ' ';
    formatNumber(number, [&](const ValueView& text) { numbers += text.text; });
  }
  sink({numbers, true});
}

/// What has no text is written as its numbers.
template <typename T>
void formatTimes(std::span<const std::string> texts, std::span<const T> numbers, const Sink& sink) {
  const std::size_t elements = texts.empty() ? 1 : numbers.size() / texts.size();
  for (const std::string& text : texts) {
    if (text.empty()) {
      formatRawTime(numbers.first(elements), sink);
    } else {
      sink({text, true});
    }
    numbers = numbers.subspan(elements);
  }
}

void formatTimes(Module& module, ArrayView array, Datatype datatype, TimeForm form,
                 const Sink& sink) {
  const std::vector<std::string> texts =
      form == TimeForm::kCalendar
          ? timesAsText(module, array, datatype)
          : std::vector<std::string>(array.elementCount() / elementsPerValue(datatype, 1));
  if (array.classId() == ClassId::kInt64) {
    formatTimes(std::span(texts), array.data<std::int64_t>(), sink);
  } else {
    formatTimes(std::span(texts), array.data<double>(), sink);
  }
}

}  // namespace

void eachValue(Module& module, ArrayView array, Datatype datatype, std::size_t elements,
               TimeForm form, const Sink& sink) {
  if (isTimeType(datatype)) return formatTimes(module, array, datatype, form, sink);
  if (!isCharacterType(datatype)) {
    return visit(array, [&](auto numbers) { formatNumbers(numbers, sink); });
  }
  for (const std::string& text : textsOf(array, elements))
    sink({text, true});
}

std::vector<ValueText> formatValues(Module& module, ArrayView array, Datatype datatype,
                                    std::size_t elements) {
  std::vector<ValueText> values;
  eachValue(module, array, datatype, elements, TimeForm::kCalendar, [&](const ValueView& value) {
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
