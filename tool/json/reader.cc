#include <algorithm>
#include <array>
#include <cmath>
#include <concepts>
#include <limits>
#include <string>
#include <type_traits>
#include <utility>
#include <vector>

#include "ambrix/visit.h"
#include "tool/json/value.h"

namespace ambrix::tool {
namespace {

ClassId classNamed(const Json& name) {
  for (const ClassId classId : kClassIds) {
    if (name == className(classId)) return classId;
  }
  throw JsonError("an unknown class");
}

const Json& requireMember(const Json& object, const char* key) {
  const auto member = object.find(key);
  if (member == object.end()) throw JsonError("an array needs \"class\", \"size\" and \"data\"");
  return *member;
}

const Json& requireList(const Json& value) {
  if (!value.is_array()) throw JsonError("not a list");
  return value;
}

std::vector<std::size_t> readSizes(const Json& list) {
  std::vector<std::size_t> sizes(requireList(list).size());
  std::ranges::transform(list, sizes.begin(), readCount);
  if (sizes.size() < 2) throw JsonError("an array has at least two sizes");
  return sizes;
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
T readNonFinite(const std::string& text) {
  if (text == "NaN") return std::numeric_limits<T>::quiet_NaN();
  if (text == "Inf") return std::numeric_limits<T>::infinity();
  if (text == "-Inf") return -std::numeric_limits<T>::infinity();
  throw JsonError("a text that is not a number");
}

template <std::floating_point T>
void readElement(const Json& item, T& value) {
  if (item.is_string()) {
    value = readNonFinite<T>(item.get_ref<const std::string&>());
    return;
  }
  if (!item.is_number()) throw JsonError("not a number");
  value = item.get<T>();
  if (!std::isfinite(value)) throw JsonError("a number beyond the range of its class");
}

void readElement(const Json& item, bool& value) {
  if (!item.is_boolean()) throw JsonError("not a logical value");
  value = item.get<bool>();
}

template <std::integral T>
void readElement(const Json& item, T& value) {
  if (!item.is_number_integer()) throw JsonError("not an integer");
  const bool fits = item.is_number_unsigned() ? std::in_range<T>(item.get<std::uint64_t>())
                                              : std::in_range<T>(item.get<std::int64_t>());
  if (!fits) throw JsonError("an integer beyond the range of its class");
  value = item.get<T>();
}

template <ArrayElement T>
Array readElements(std::span<const std::size_t> sizes, const Json& data) {
  requireCount(sizes, requireList(data).size());
  Array array = Array::uninitialized(classIdOf<T>(), sizes);
  auto item = data.begin();
  for (T& value : array.mutableData<T>())
    readElement(*item++, value);
  return array;
}

Array readChars(std::span<const std::size_t> sizes, const Json& data) {
  const std::u16string units = unitsOf(data);
  requireCount(sizes, units.size());
  return Array::of(std::span<const char16_t>(units), sizes);
}

Array readCells(std::span<const std::size_t> sizes, const Json& data) {
  requireCount(sizes, requireList(data).size());
  Array array = Array::cell(sizes);
  for (std::size_t index = 0; index < data.size(); ++index)
    array.setElement(index, readValue(data[index]));
  return array;
}

Array readData(ClassId classId, std::span<const std::size_t> sizes, const Json& data) {
  return visitClass(
      classId,
      Overloaded{[&](std::type_identity<ArrayView>) { return readCells(sizes, data); },
                 [&](std::type_identity<char16_t>) { return readChars(sizes, data); },
                 [&]<typename T>(std::type_identity<T>) { return readElements<T>(sizes, data); }});
}

/// The short forms of numbers and logicals in a row.
Array readList(const Json& list) {
  if (list.empty()) return Array::zeros(ClassId::kDouble, {0, 0});
  const std::array<std::size_t, 2> row = {1, list.size()};
  if (list.front().is_boolean()) return readElements<bool>(row, list);
  if (!std::ranges::all_of(list, [](const Json& item) { return item.is_number(); })) {
    throw JsonError("not a list of numbers or of logicals");
  }
  return readElements<double>(row, list);
}

Array readNumber(const Json& number) {
  double value = 0;
  readElement(number, value);
  return Array::scalar(value);
}

}  // namespace

std::size_t readCount(const Json& value) {
  std::size_t count = 0;
  readElement(value, count);
  return count;
}

Array readValue(const Json& value) {
  if (value.is_null()) return Array::zeros(ClassId::kDouble, {0, 0});
  if (value.is_boolean()) return Array::scalar(value.get<bool>());
  if (value.is_number()) return readNumber(value);
  if (value.is_string()) return Array::text(unitsOf(value));
  if (value.is_array()) return readList(value);
  const ClassId classId = classNamed(requireMember(value, "class"));
  const std::vector<std::size_t> sizes = readSizes(requireMember(value, "size"));
  return readData(classId, sizes, requireMember(value, "data"));
}

}  // namespace ambrix::tool
