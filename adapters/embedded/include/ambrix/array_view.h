// What a host array is and holds, seen without owning it.
#pragma once

#include <array>
#include <concepts>
#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <type_traits>

#include "ambrix/export.h"

struct qvArray;

namespace ambrix {

/// The classes of host arrays. The numbers are those of the module's interface and never change.
enum class ClassId : int {
  kUnknown = 0,
  kCell = 1,
  kLogical = 3,
  kChar = 4,
  kDouble = 6,
  kSingle = 7,
  kInt8 = 8,
  kUint8 = 9,
  kInt16 = 10,
  kUint16 = 11,
  kInt32 = 12,
  kUint32 = 13,
  kInt64 = 14,
  kUint64 = 15,
};

/// The classes that arrays can have.
inline constexpr std::array kClassIds = {
    ClassId::kCell,   ClassId::kLogical, ClassId::kChar,  ClassId::kDouble, ClassId::kSingle,
    ClassId::kInt8,   ClassId::kUint8,   ClassId::kInt16, ClassId::kUint16, ClassId::kInt32,
    ClassId::kUint32, ClassId::kInt64,   ClassId::kUint64};

/// The class whose elements are C++ values of type T; kUnknown when there is none.
template <typename T>
constexpr ClassId classIdOf() {
  if constexpr (std::is_same_v<T, bool>) return ClassId::kLogical;
  if constexpr (std::is_same_v<T, char16_t>) return ClassId::kChar;
  if constexpr (std::is_same_v<T, double>) return ClassId::kDouble;
  if constexpr (std::is_same_v<T, float>) return ClassId::kSingle;
  if constexpr (std::is_integral_v<T> && !std::is_same_v<T, bool> && !std::is_same_v<T, char> &&
                !std::is_same_v<T, wchar_t> && !std::is_same_v<T, char8_t> &&
                !std::is_same_v<T, char16_t> && !std::is_same_v<T, char32_t>) {
    constexpr int kBase = std::is_signed_v<T> ? 8 : 9;
    constexpr int kLog2 = sizeof(T) == 1 ? 0 : sizeof(T) == 2 ? 1 : sizeof(T) == 4 ? 2 : 3;
    return static_cast<ClassId>(kBase + 2 * kLog2);
  }
  return ClassId::kUnknown;
}

/// A C++ type that some class of arrays holds: a number, bool or char16_t.
template <typename T>
concept ArrayElement = (classIdOf<T>() != ClassId::kUnknown);

/// The class as people know it: "double", "single", "int8", ..., "char", "logical", "cell".
AMBRIX_EXPORT const char* className(ClassId classId) noexcept;

/// A borrowed array, or none. It is a pointer: copy it freely, and don't outlive the owner.
/// Apart from `operator bool` and `handle`, members need an array.
class AMBRIX_EXPORT ArrayView {
 public:
  constexpr ArrayView() noexcept = default;
  constexpr explicit ArrayView(const qvArray* array) noexcept : array_(array) {}

  /// Whether there is an array.
  constexpr explicit operator bool() const noexcept { return array_ != nullptr; }
  /// The array as the module's interface knows it.
  [[nodiscard]] constexpr const qvArray* handle() const noexcept { return array_; }

  [[nodiscard]] ClassId classId() const noexcept;
  [[nodiscard]] const char* className() const noexcept;
  /// The sizes, first dimension first: at least two.
  [[nodiscard]] std::span<const std::size_t> size() const noexcept;
  /// The number of elements: the product of the sizes.
  [[nodiscard]] std::size_t elementCount() const noexcept;

  /// The elements, first dimension fastest; of a cell array, nothing.
  [[nodiscard]] std::span<const std::byte> bytes() const noexcept;

  /// The elements as C++ values. Throws std::logic_error when the class holds other values.
  template <ArrayElement T>
  [[nodiscard]] std::span<const T> data() const {
    return {static_cast<const T*>(elementsOf(classIdOf<T>())), elementCount()};
  }

  /// The units of a character array, first dimension fastest. Throws std::logic_error for others.
  [[nodiscard]] std::u16string_view chars() const;
  [[nodiscard]] std::u16string text() const { return std::u16string(chars()); }
  /// The same as UTF-8; an unpaired surrogate becomes U+FFFD.
  [[nodiscard]] std::string utf8() const;

  /// An element of a cell array, which may be unset. Throws std::logic_error for other classes and
  /// std::out_of_range.
  [[nodiscard]] ArrayView element(std::size_t index) const;

 protected:
  /// Throws std::logic_error unless the array is of that class.
  [[nodiscard]] const void* elementsOf(ClassId classId) const;

  const qvArray* array_ = nullptr;
};

}  // namespace ambrix
