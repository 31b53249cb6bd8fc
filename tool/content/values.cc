#include "tool/content/values.h"

#include <fmt/format.h>

#include <cmath>
#include <span>
#include <stdexcept>

#include "ambrix/visit.h"
#include "tool/content/cdf_file.h"
#include "tool/output/text.h"

namespace ambrix::tool {
namespace {

constexpr double kEndOfTimeMilliseconds = 315569520000000.0;  // the year 10000
constexpr double kEndOfTimeSeconds = 315569520000.0;
constexpr double kPicosecondsPerSecond = 1e12;

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

/// "2004-05-13T15:08:11.022", or finer where there are parts below the millisecond.
std::string formatTime(std::span<const double> parts) {
  const auto part = [&](std::size_t i) { return std::lround(parts[i]); };
  std::string text = fmt::format("{:04}-{:02}-{:02}T{:02}:{:02}:{:02}.", part(0), part(1), part(2),
                                 part(3), part(4), part(5));
  for (std::size_t i = 6; i < parts.size(); ++i)
    text += fmt::format("{:03}", part(i));
  return text;
}

std::vector<ValueText> formatEpochs(Module& module, ArrayView array) {
  const std::vector<Array> broken = module.call("epochBreakdown", {array});
  const std::span<const double> parts = broken.at(0).data<double>();
  std::vector<ValueText> texts;
  for (const double epoch : array.data<double>()) {
    const bool isTime = epoch >= 0 && epoch < kEndOfTimeMilliseconds;
    const std::span<const double> own = parts.subspan(7 * texts.size(), 7);
    texts.push_back(isTime ? ValueText{formatTime(own), true} : formatNumber(epoch));
  }
  return texts;
}

ValueText formatEpoch16(double seconds, double picoseconds, std::span<const double> parts) {
  const bool isTime = seconds >= 0 && seconds < kEndOfTimeSeconds && picoseconds >= 0 &&
                      picoseconds < kPicosecondsPerSecond;
  if (isTime) return {formatTime(parts), true};
  return {formatNumber(seconds).text + ' ' + formatNumber(picoseconds).text, true};
}

std::vector<ValueText> formatEpochs16(Module& module, ArrayView array) {
  const std::vector<Array> broken = module.call("epoch16Breakdown", {array});
  const std::span<const double> parts = broken.at(0).data<double>();
  const std::span<const double> values = array.data<double>();
  std::vector<ValueText> texts;
  for (std::size_t k = 0; 2 * k + 1 < values.size(); ++k)
    texts.push_back(formatEpoch16(values[2 * k], values[2 * k + 1], parts.subspan(10 * k, 10)));
  return texts;
}

std::vector<ValueText> formatTexts(ArrayView array, std::size_t length) {
  const std::string bytes = bytesOf(array);
  std::vector<ValueText> texts;
  if (length == 0) return {ValueText{"", true}};
  for (std::size_t start = 0; start < bytes.size(); start += length)
    texts.push_back({bytes.substr(start, length), true});
  return texts;
}

std::vector<ValueText> formatNumbers(ArrayView cells) {
  throw std::logic_error(std::string("no value is of class ") + cells.className());
}

}  // namespace

bool isCharacterType(std::string_view datatype) {
  return datatype == "cdf_char" || datatype == "cdf_uchar";
}

std::size_t hostElements(std::string_view datatype, std::size_t elements) {
  if (isCharacterType(datatype)) return elements;
  return datatype == "cdf_epoch16" ? 2 : 1;
}

std::vector<ValueText> formatValues(Module& module, ArrayView array, std::string_view datatype,
                                    std::size_t elements) {
  if (isCharacterType(datatype)) return formatTexts(array, elements);
  if (datatype == "cdf_epoch") return formatEpochs(module, array);
  if (datatype == "cdf_epoch16") return formatEpochs16(module, array);
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
