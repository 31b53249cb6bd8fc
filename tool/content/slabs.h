// A variable's data in pieces that fit in memory.
#pragma once

#include <cstddef>
#include <optional>
#include <vector>

#include "tool/content/cdf_file.h"
#include "tool/content/variable.h"

namespace ambrix::tool {

/// A block of values: records, and in each of them a range of every dimension, in host order.
struct Slab {
  std::size_t firstRecord = 0;
  std::size_t records = 0;
  std::vector<std::size_t> start;
  std::vector<std::size_t> count;

  /// The values in the slab.
  [[nodiscard]] std::size_t values() const;
};

/// Divides records first to last into slabs of about a million values at most. Read one after the
/// other, slabs give the values in the order of the host: first dimension fastest, records last.
class SlabPlan {
 public:
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

/// Which variable and which of its values: all that the hyperslab commands need but the data.
std::vector<Array> slabArguments(const Variable& variable, const Slab& slab);
Array readSlab(CdfFile& file, const Variable& variable, const Slab& slab);
void writeSlab(CdfFile& file, const Variable& variable, const Slab& slab, ArrayView data);

/// The number of records that the variable has, counting those between that were never written.
std::size_t countRecords(CdfFile& file, const Variable& variable);

}  // namespace ambrix::tool
