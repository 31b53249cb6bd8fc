// What a variable of a file is, and which part of its values is meant.
#pragma once

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

#include "ambrix/datatype.h"
#include "ambrix/export.h"

namespace ambrix {

/// A variable's definition. Sizes and variances are in the order of dimensions in arrays, fastest
/// first.
struct AMBRIX_EXPORT Variable {
  std::size_t number = 0;
  std::string name;  // its bytes in the file
  Datatype datatype = Datatype::kReal8;
  bool supported = true;     // else nothing below is known
  std::size_t elements = 1;  // the characters of a text
  std::vector<std::size_t> sizes = {};
  bool recordVaries = true;
  std::vector<bool> varies = {};  // for a new variable: none means that all dimensions vary

  /// The array elements of one value and of one record.
  [[nodiscard]] std::size_t valueElements() const noexcept;
  [[nodiscard]] std::size_t recordElements() const noexcept;
};

/// How a file or a variable is compressed, in the words of the commands.
struct Compression {
  std::string type = "NO_COMPRESSION";
  std::string parameter = {};  // "6" (the level of GZIP), "RLE_OF_ZEROs", ...
  double percentage = 100;     // of the uncompressed size, as of the last closing
};

/// A block of values: records, and in each of them a range of every dimension.
struct AMBRIX_EXPORT Slab {
  std::size_t firstRecord = 0;
  std::size_t records = 0;
  std::vector<std::size_t> start;
  std::vector<std::size_t> count;
  std::size_t recordStep = 1;
  std::vector<std::size_t> step = {};  // none means 1 for each dimension

  /// Whole records.
  static Slab ofRecords(const Variable& variable, std::size_t first, std::size_t records,
                        std::size_t recordStep = 1);
  /// The values in the slab, and the array elements that they take.
  [[nodiscard]] std::size_t values() const noexcept;
  [[nodiscard]] std::size_t elements(const Variable& variable) const noexcept;
};

/// Divides records into slabs of about a million array elements at most. Read one after the other,
/// slabs give the values in the order of arrays: first dimension fastest, records last.
class AMBRIX_EXPORT SlabPlan {
 public:
  /// The records from the first to the one before the end.
  SlabPlan(const Variable& variable, std::size_t firstRecord, std::size_t endRecord);
  std::optional<Slab> next();

 private:
  void planRecord(const Variable& variable);
  [[nodiscard]] Slab wholeRecords();
  [[nodiscard]] Slab partOfRecord();
  void advance();

  std::vector<std::size_t> sizes_;
  std::size_t record_;
  std::size_t endRecord_;
  std::size_t recordsAtOnce_ = 1;
  bool split_ = false;              // whether a record is too large to be read at once
  std::size_t splitDimension_ = 0;  // slabs span those before it, and `step_` items of it
  std::size_t step_ = 1;
  std::vector<std::size_t> position_;
};

}  // namespace ambrix
