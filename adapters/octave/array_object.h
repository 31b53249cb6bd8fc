// The array behind the handle that the module sees, over Octave's own arrays.
#pragma once

#include <octave/oct.h>

#include <cstddef>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <variant>
#include <vector>

#include "adapters/common/array_functions.h"
#include "adapters/common/tracked.h"

namespace ambrix::octave_host {

/// 16-bit characters, which Octave does not have: widened from an argument, or to be narrowed.
using Characters = std::unique_ptr<char16_t[]>;
using Cells = std::vector<qvArray*>;

/// Elements in the storage that Octave holds them in, or will: nothing is copied on the way.
using Elements =
    std::variant<std::monostate, double, octave_uint64, NDArray, FloatNDArray, int8NDArray,
                 uint8NDArray, int16NDArray, uint16NDArray, int32NDArray, uint32NDArray,
                 int64NDArray, uint64NDArray, boolNDArray, Characters, Cells>;

}  // namespace ambrix::octave_host

/// Either an argument, whose elements are taken out when they are first asked for, since getting at
/// those of ranges, sparse matrices and the like means to compute them, or a result.
struct qvArray : ambrix::Tracked {
 public:
  explicit qvArray(const octave_value& argument);
  /// A result. Raises the host's errors; throws std::logic_error for a class that results cannot
  /// have.
  qvArray(qvClassID classId, std::span<const std::size_t> sizes, ambrix::Content content);

  [[nodiscard]] qvClassID classId() const { return classId_; }
  [[nodiscard]] const char* className() const;
  [[nodiscard]] std::size_t elementCount() const;
  [[nodiscard]] std::span<const std::size_t> sizes() const;

  /// Null for classes without plain elements.
  [[nodiscard]] void* data() const;
  /// The characters as Octave has them; for the class char.
  [[nodiscard]] charNDArray bytes() const;
  /// Null for other classes than cell.
  [[nodiscard]] ambrix::octave_host::Cells* cells() const;

  /// A result as Octave's users get it.
  [[nodiscard]] octave_value toOctave() const;

 private:
  void takeOut() const;
  void widenArgument() const;
  void takeOutCells() const;
  void create(const dim_vector& dims, ambrix::Content content);
  template <typename OctaveArray>
  void hold(const OctaveArray& array) const;
  template <typename OctaveArray>
  void make(const dim_vector& dims, ambrix::Content content);

  qvClassID classId_;
  octave_value argument_;  // undefined in a result
  mutable ambrix::octave_host::Elements elements_;
  mutable void* data_ = nullptr;
  mutable std::optional<dim_vector> dims_;
  mutable std::string className_;          // where no class number tells it
  mutable std::vector<qvArray> children_;  // the arrays in a cell argument
};
