// Host arrays that a program makes and owns.
#pragma once

#include <initializer_list>
#include <memory>
#include <span>
#include <string_view>
#include <type_traits>
#include <utility>
#include <vector>

#include "ambrix/array_view.h"
#include "ambrix/export.h"
#include "ambrix/owned_elements.h"

namespace ambrix {

/// A list of sizes for a call: {2, 3}, a vector or a span. It borrows, so pass it on at once.
class Sizes : public std::span<const std::size_t> {
 public:
  constexpr Sizes(std::initializer_list<std::size_t> sizes)
      : span(std::data(sizes), sizes.size()) {}
  Sizes(const std::vector<std::size_t>& sizes) : span(sizes) {}
  constexpr Sizes(std::span<const std::size_t> sizes) : span(sizes) {}
};

/// An array and its memory. Moving is cheap and leaves an empty handle; copies are explicit.
///
/// Every array has at least two dimensions: a list of one size n makes an n-by-1 array, none makes
/// 0-by-0, and trailing sizes of 1 beyond the second are dropped. Factories throw `Error`
/// "TOLVEX:host:badDimension" for a size that is negative when taken as signed and
/// "TOLVEX:host:outOfMemory" for an array that cannot be had, and std::invalid_argument for data
/// that do not fit the sizes.
class AMBRIX_EXPORT Array : public ArrayView {
 public:
  Array() noexcept = default;
  Array(Array&& other) noexcept : ArrayView(std::exchange(other.array_, nullptr)) {}
  Array& operator=(Array&& other) noexcept;
  Array(const Array&) = delete;
  Array& operator=(const Array&) = delete;
  ~Array();

  /// Numbers that are 0, characters U+0000, logicals false, or unset cells.
  static Array zeros(ClassId classId, Sizes sizes);
  /// Numbers, characters or logicals for a caller who writes every one of them.
  static Array uninitialized(ClassId classId, Sizes sizes);
  /// The given bytes as the elements of an array of numbers, characters or logicals.
  static Array fromBytes(ClassId classId, Sizes sizes, std::span<const std::byte> elements);

  /// An array over memory of the caller's, as an argument that is not copied: its elements are read
  /// where they are, and nobody writes to them, neither the module nor `mutableData`. The memory
  /// must stay as long as the array, also when a cell array has taken it over; `keeper`, when it is
  /// given, lives as long as the array and is let go, in whatever thread, with it. It must not
  /// throw then. Elements are numbers, characters, or logicals with bytes of 0 and 1. They must be
  /// aligned for their type, else, or when they do not fill the sizes, it is a
  /// std::invalid_argument. A copy of the array owns its memory. `setByteLimit` does not matter
  /// here.
  static Array borrowed(ClassId classId, Sizes sizes, std::span<const std::byte> elements,
                        std::shared_ptr<const void> keeper = nullptr);
  template <ArrayElement T>
  static Array borrowed(std::span<const T> values, Sizes sizes,
                        std::shared_ptr<const void> keeper = nullptr) {
    return borrowed(classIdOf<T>(), sizes, std::as_bytes(values), std::move(keeper));
  }

  /// A 1-by-1 array.
  template <ArrayElement T>
  static Array scalar(T value) {
    return fromBytes(classIdOf<T>(), {1, 1}, std::as_bytes(std::span<const T>(&value, 1)));
  }
  /// An array of the given values, first dimension fastest.
  template <ArrayElement T>
  static Array of(std::span<const T> values, Sizes sizes) {
    return fromBytes(classIdOf<T>(), sizes, std::as_bytes(values));
  }
  /// A 1-by-N array.
  template <ArrayElement T>
  static Array row(std::span<const T> values) {
    return of(values, {1, values.size()});
  }
  template <ArrayElement T>
  static Array row(std::initializer_list<T> values) {
    return row(std::span<const T>(std::data(values), values.size()));
  }

  /// A 1-by-N character array of these units; an empty text is 0-by-0.
  static Array text(std::u16string_view units);
  /// The same from UTF-8. Throws std::invalid_argument when the text is not valid UTF-8.
  static Array fromUtf8(std::string_view utf8);
  /// The same with byte b as the unit b.
  static Array fromNarrow(std::string_view bytes);

  /// A cell array with no element set.
  static Array cell(Sizes sizes) { return zeros(ClassId::kCell, sizes); }
  /// Puts an array into a cell array, in place of what was there. Throws like `element`.
  void setElement(std::size_t index, Array value);

  /// A deep copy.
  [[nodiscard]] Array clone() const { return copyOf(*this); }
  static Array copyOf(ArrayView array);

  /// The elements for writing. Throws std::logic_error when the class holds other values and when
  /// they are borrowed.
  template <ArrayElement T>
  [[nodiscard]] std::span<T> mutableData() {
    return {static_cast<T*>(mutableElementsOf(classIdOf<T>())), elementCount()};
  }
  using ArrayView::text;

  /// Gives up the elements, which stay where they are, with the duty to free them; the handle is
  /// empty then. Null when there are none. Few elements lie in one block of memory with the array's
  /// sizes: freeing the elements frees all of it. Until then `liveCounts` counts the array. Throws
  /// std::logic_error for a cell array and for elements that are borrowed, and leaves the array as
  /// it is.
  [[nodiscard]] OwnedElements releaseElements();

  /// Takes over an array that the module's interface has made, from the call that made it as well.
  static Array adopt(qvArray* array) noexcept;
  /// Gives the array up; the caller owns it.
  [[nodiscard]] qvArray* release() noexcept;

 private:
  explicit Array(const qvArray* array) noexcept : ArrayView(array) {}
  void* mutableElementsOf(ClassId classId);
};

}  // namespace ambrix
