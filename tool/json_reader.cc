#include <algorithm>
#include <array>
#include <concepts>
#include <limits>
#include <utility>
#include <vector>

#include "tool/json_value.h"

namespace ambrix::tool {
namespace {

constexpr std::array kClasses = {
    ClassId::kCell,   ClassId::kLogical, ClassId::kChar,  ClassId::kDouble, ClassId::kSingle,
    ClassId::kInt8,   ClassId::kUint8,   ClassId::kInt16, ClassId::kUint16, ClassId::kInt32,
    ClassId::kUint32, ClassId::kInt64,   ClassId::kUint64};

ClassId classNamed(std::u16string_view name) {
  for (const ClassId classId : kClasses) {
    if (std::ranges::equal(std::string_view(className(classId)), name)) return classId;
  }
  throw JsonError("an unknown class");
}

JsonView requireMember(JsonView object, std::u16string_view key) {
  const auto member = findMember(object, key);
  if (!member) throw JsonError("an array needs \"class\", \"size\" and \"data\"");
  return *member;
}

std::vector<std::size_t> readSizes(JsonView list) {
  std::vector<std::size_t> sizes;
  JsonItems items(list);
  while (const auto item = items.next())
    sizes.push_back(item->toUint64());
  if (sizes.size() < 2) throw JsonError("an array has at least two sizes");
  return sizes;
}

std::size_t countItems(JsonView list) {
  std::size_t count = 0;
  JsonItems items(list);
  while (items.next())
    ++count;
  return count;
}

bool sizesHold(std::span<const std::size_t> sizes, std::size_t count) {
  if (std::ranges::count(sizes, 0U) > 0) return count == 0;
  for (const std::size_t size : sizes) {
    if (count % size != 0) return false;
    count /= size;
  }
  return count == 1;
}

/// Throws `JsonError` unless an array of these sizes has that many elements.
void requireCount(std::span<const std::size_t> sizes, std::size_t count) {
  if (!sizesHold(sizes, count)) throw JsonError("the data do not fit the size");
}

template <std::floating_point T>
T readNonFinite(std::u16string_view text) {
  if (text == u"NaN") return std::numeric_limits<T>::quiet_NaN();
  if (text == u"Inf") return std::numeric_limits<T>::infinity();
  if (text == u"-Inf") return -std::numeric_limits<T>::infinity();
  throw JsonError("a text that is no number");
}

void readElement(JsonView item, double& value) {
  const bool text = item.kind() == JsonKind::kString;
  value = text ? readNonFinite<double>(item.string()) : item.toDouble();
}

void readElement(JsonView item, float& value) {
  const bool text = item.kind() == JsonKind::kString;
  value = text ? readNonFinite<float>(item.string()) : item.toSingle();
}

void readElement(JsonView item, bool& value) {
  value = item.kind() == JsonKind::kTrue;
  if (!value && item.kind() != JsonKind::kFalse) throw JsonError("not a logical value");
}

template <std::integral T>
void readElement(JsonView item, T& value) {
  using Wide = std::conditional_t<std::is_signed_v<T>, std::int64_t, std::uint64_t>;
  Wide wide = 0;
  if constexpr (std::is_signed_v<T>) {
    wide = item.toInt64();
  } else {
    wide = item.toUint64();
  }
  if (!std::in_range<T>(wide)) throw JsonError("an integer beyond the range of its class");
  value = static_cast<T>(wide);
}

template <ArrayElement T>
Array readElements(std::span<const std::size_t> sizes, JsonView data) {
  requireCount(sizes, countItems(data));
  Array array = Array::uninitialized(classIdOf<T>(), sizes);
  JsonItems items(data);
  for (T& value : array.mutableData<T>())
    readElement(items.next().value(), value);
  return array;
}

Array readChars(std::span<const std::size_t> sizes, JsonView data) {
  const std::u16string units = data.string();
  requireCount(sizes, units.size());
  return Array::of(std::span<const char16_t>(units), sizes);
}

Array readCells(std::span<const std::size_t> sizes, JsonView data) {
  const std::size_t count = countItems(data);
  requireCount(sizes, count);
  Array array = Array::cell(sizes);
  JsonItems items(data);
  for (std::size_t index = 0; index < count; ++index)
    array.setElement(index, readValue(items.next().value()));
  return array;
}

Array readData(ClassId classId, std::span<const std::size_t> sizes, JsonView data) {
  switch (classId) {
    case ClassId::kCell:
      return readCells(sizes, data);
    case ClassId::kLogical:
      return readElements<bool>(sizes, data);
    case ClassId::kChar:
      return readChars(sizes, data);
    case ClassId::kDouble:
      return readElements<double>(sizes, data);
    case ClassId::kSingle:
      return readElements<float>(sizes, data);
    case ClassId::kInt8:
      return readElements<std::int8_t>(sizes, data);
    case ClassId::kUint8:
      return readElements<std::uint8_t>(sizes, data);
    case ClassId::kInt16:
      return readElements<std::int16_t>(sizes, data);
    case ClassId::kUint16:
      return readElements<std::uint16_t>(sizes, data);
    case ClassId::kInt32:
      return readElements<std::int32_t>(sizes, data);
    case ClassId::kUint32:
      return readElements<std::uint32_t>(sizes, data);
    case ClassId::kInt64:
      return readElements<std::int64_t>(sizes, data);
    default:
      return readElements<std::uint64_t>(sizes, data);
  }
}

/// The short forms of numbers and logicals in a row.
Array readList(JsonView list) {
  const std::size_t count = countItems(list);
  if (count == 0) return Array::zeros(ClassId::kDouble, {0, 0});
  const JsonKind kind = JsonItems(list).next()->kind();
  const bool logical = kind == JsonKind::kTrue || kind == JsonKind::kFalse;
  JsonItems items(list);
  while (const auto item = items.next()) {
    if (!logical && item->kind() != JsonKind::kNumber) throw JsonError("not a list of numbers");
  }
  const std::array<std::size_t, 2> row = {1, count};
  return logical ? readElements<bool>(row, list) : readElements<double>(row, list);
}

}  // namespace

Array readValue(JsonView value) {
  switch (value.kind()) {
    case JsonKind::kNull:
      return Array::zeros(ClassId::kDouble, {0, 0});
    case JsonKind::kTrue:
    case JsonKind::kFalse:
      return Array::scalar(value.kind() == JsonKind::kTrue);
    case JsonKind::kNumber:
      return Array::scalar(value.toDouble());
    case JsonKind::kString:
      return Array::text(value.string());
    case JsonKind::kList:
      return readList(value);
    default:
      break;
  }
  const ClassId classId = classNamed(requireMember(value, u"class").string());
  const std::vector<std::size_t> sizes = readSizes(requireMember(value, u"size"));
  return readData(classId, sizes, requireMember(value, u"data"));
}

}  // namespace ambrix::tool
