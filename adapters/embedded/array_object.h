// The array behind the handle that the module sees.
#pragma once

#include <cstddef>
#include <memory>
#include <span>
#include <string_view>

#include "adapters/common/array_functions.h"
#include "adapters/common/tracked.h"

namespace ambrix {

enum class Storage : unsigned char { kInline, kOwnBlock, kBorrowed };

}  // namespace ambrix

/// One block of memory: this, the sizes and, when they are few, the elements. Many elements have
/// a block of their own. Behind the sizes of borrowed elements is what keeps them.
struct alignas(std::max_align_t) qvArray : ambrix::Tracked {
  qvClassID classId = qvUNKNOWN_CLASS;
  ambrix::Storage storage = ambrix::Storage::kInline;
  std::size_t elementCount = 0;
  std::size_t dimensionCount = 0;
  void* elements = nullptr;  // null when there are none

  [[nodiscard]] std::size_t* sizes() { return reinterpret_cast<std::size_t*>(this + 1); }
  [[nodiscard]] const std::size_t* sizes() const {
    return reinterpret_cast<const std::size_t*>(this + 1);
  }
  /// The elements of a cell array.
  [[nodiscard]] std::span<qvArray*> cells() const {
    return {static_cast<qvArray**>(elements), elementCount};
  }
};

namespace ambrix {

/// Bytes of an element; 0 for a class that arrays cannot have.
std::size_t elementBytes(qvClassID classId) noexcept;

/// A new array that is on no list and belongs to the caller. Cells are always unset. Raises the
/// host's errors; throws std::logic_error for a class that arrays cannot have.
qvArray* makeArray(qvClassID classId, std::span<const std::size_t> sizes, Content content);

/// The same over elements of somebody else. Throws std::invalid_argument for elements that do not
/// fill the sizes, are not aligned or of a class that has none.
qvArray* borrowElements(qvClassID classId, std::span<const std::size_t> sizes,
                        std::span<const std::byte> elements, std::shared_ptr<const void> keeper);

/// A deep copy that is on no list and belongs to the caller.
qvArray* copyArray(const qvArray& array);

/// A 1-by-N text of these units, or of byte b as the unit b; an empty one is 0-by-0.
qvArray* makeText(std::u16string_view units);
qvArray* makeNarrowText(std::string_view bytes);

/// The place of a cell. Throws std::logic_error for other classes and std::out_of_range.
qvArray*& cellAt(const qvArray& array, std::size_t index);
/// Makes the cell array the owner of the value, which may be null, and frees what it held there.
/// Throws like `cellAt`.
void setCell(const qvArray& array, std::size_t index, qvArray* value);

/// Frees the array with all it holds, taking it off its list. Null is fine.
void destroyArray(qvArray* array) noexcept;

}  // namespace ambrix
