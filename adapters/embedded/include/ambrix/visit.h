// The elements of an array of any class, in their C++ type.
#pragma once

#include <cstdint>
#include <span>
#include <stdexcept>
#include <type_traits>
#include <utility>

#include "ambrix/array_view.h"

namespace ambrix {

/// Several functions as one: `visit` calls the one whose parameter fits best.
template <typename... Functions>
struct Overloaded : Functions... {
  using Functions::operator()...;
};
template <typename... Functions>
Overloaded(Functions...) -> Overloaded<Functions...>;

/// Calls the function with std::type_identity<T>, T being the C++ type of an element of this class:
/// a number, bool, char16_t, or ArrayView for the elements of a cell array. Returns what the
/// function does, in the same type for each class. Throws std::logic_error for a class that arrays
/// cannot have.
template <typename Function>
constexpr decltype(auto) visitClass(ClassId classId, Function&& function) {
  switch (classId) {
    case ClassId::kCell:
      return function(std::type_identity<ArrayView>());
    case ClassId::kLogical:
      return function(std::type_identity<bool>());
    case ClassId::kChar:
      return function(std::type_identity<char16_t>());
    case ClassId::kDouble:
      return function(std::type_identity<double>());
    case ClassId::kSingle:
      return function(std::type_identity<float>());
    case ClassId::kInt8:
      return function(std::type_identity<std::int8_t>());
    case ClassId::kUint8:
      return function(std::type_identity<std::uint8_t>());
    case ClassId::kInt16:
      return function(std::type_identity<std::int16_t>());
    case ClassId::kUint16:
      return function(std::type_identity<std::uint16_t>());
    case ClassId::kInt32:
      return function(std::type_identity<std::int32_t>());
    case ClassId::kUint32:
      return function(std::type_identity<std::uint32_t>());
    case ClassId::kInt64:
      return function(std::type_identity<std::int64_t>());
    case ClassId::kUint64:
      return function(std::type_identity<std::uint64_t>());
    case ClassId::kUnknown:
      break;
  }
  throw std::logic_error("no array can have this class");
}

/// Calls the function with the elements as a span of their type: std::span<const double> for class
/// double, std::span<const bool> for logical, std::span<const char16_t> for char. For a cell array
/// it is called with the ArrayView itself, which gives the elements. Returns what the function
/// does, in the same type for each class. Throws std::logic_error when there is no array.
///
///   visit(array, Overloaded{
///       [](ArrayView cells) { std::cout << cells.elementCount() << " arrays"; },
///       [](std::span<const char16_t> text) { std::cout << text.size() << " characters"; },
///       [](auto values) { std::cout << values.size() << " numbers or logicals"; }});
template <typename Function>
decltype(auto) visit(ArrayView array, Function&& function) {
  if (!array) throw std::logic_error("there is no array");
  return visitClass(array.classId(), [&]<typename T>(std::type_identity<T>) -> decltype(auto) {
    if constexpr (ArrayElement<T>) {
      return function(array.data<T>());
    } else {
      return function(array);
    }
  });
}

}  // namespace ambrix
