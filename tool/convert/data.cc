// The records of the variables.
#include <algorithm>
#include <cstring>
#include <utility>

#include "tool/convert/convert.h"
#include "tool/format/record_index.h"
#include "tool/output/progress.h"
#include "tool/output/standard_output.h"

namespace ambrix::tool {
namespace {

using Bytes = std::vector<std::byte>;

/// A record's values in the reverse order of dimensions: the first index becomes the last.
void transposeRecord(const std::byte* from, std::byte* to, const std::vector<std::size_t>& counts,
                     std::size_t valueBytes) {
  std::vector<std::size_t> strides(counts.size(), 1);
  for (std::size_t i = counts.size() - 1; i > 0; --i)
    strides[i - 1] = strides[i] * counts[i];
  const std::size_t values = strides.front() * counts.front();
  std::vector<std::size_t> index(counts.size(), 0);
  std::size_t target = 0;
  for (std::size_t value = 0; value < values; ++value) {
    std::memcpy(to + target * valueBytes, from + value * valueBytes, valueBytes);
    for (std::size_t i = 0; i < counts.size(); ++i) {
      target += strides[i];
      if (++index[i] < counts[i]) break;
      target -= strides[i] * std::exchange(index[i], 0);
    }
  }
}

/// The slab's data as the output has them.
Array transposed(const Array& data, const Slab& slab) {
  Bytes result(data.bytes().size());
  const std::size_t recordBytes = data.bytes().size() / slab.records;
  const std::size_t valueBytes = data.bytes().size() / std::max<std::size_t>(slab.values(), 1);
  for (std::size_t record = 0; record < slab.records; ++record) {
    const std::size_t offset = record * recordBytes;
    transposeRecord(data.bytes().data() + offset, result.data() + offset, slab.count, valueBytes);
  }
  return Array::fromBytes(data.classId(), data.size(), result);
}

Slab reversed(Slab slab) {
  std::ranges::reverse(slab.start);
  std::ranges::reverse(slab.count);
  return slab;
}

/// Tells which records of a variable with sparse records need not be stored, because they will be
/// read as they are anyway.
class SparseFilter {
 public:
  SparseFilter(File& input, const Variable& variable, std::size_t records)
      : mode_(input.sparseRecords(variable)), last_(records - 1) {
    if (!active()) return;
    const Array pad = input.padValue(variable);
    const auto value = pad.bytes();
    const std::size_t values = variable.recordElements() / pad.elementCount();
    for (std::size_t i = 0; i < values; ++i)
      missing_.insert(missing_.end(), value.begin(), value.end());
  }

  [[nodiscard]] bool active() const { return mode_ != "NO_SPARSERECORDS"; }

  /// Asked for one record after the other.
  bool stores(std::size_t record, std::span<const std::byte> data) {
    const bool same = std::ranges::equal(data, missing_);
    if (mode_ == "PREV_SPARSERECORDS") missing_.assign(data.begin(), data.end());
    return !same || record == last_;
  }

 private:
  std::string mode_;
  std::size_t last_;
  Bytes missing_;  // what a record reads as when it is not stored
};

/// Writes the records of a slab that have to be stored, as few blocks.
void writeStored(File& output, const Variable& variable, const Slab& slab, const Array& data,
                 SparseFilter& filter) {
  const std::size_t recordBytes = data.bytes().size() / slab.records;
  const std::size_t elements = data.elementCount() / slab.records;
  const auto write = [&](std::size_t first, std::size_t end) {
    if (first == end) return;
    Slab block = slab;
    block.firstRecord += first;
    block.records = end - first;
    const auto bytes = data.bytes().subspan(first * recordBytes, block.records * recordBytes);
    output.write(variable, block,
                 Array::fromBytes(data.classId(), {elements, block.records}, bytes));
  };
  std::size_t first = 0;
  for (std::size_t i = 0; i < slab.records; ++i) {
    const auto record = data.bytes().subspan(i * recordBytes, recordBytes);
    if (filter.stores(slab.firstRecord + i, record)) continue;
    write(std::exchange(first, i + 1), i);
  }
  write(first, slab.records);
}

std::size_t countRecords(const Conversion& conversion, const Copied& variable) {
  return static_cast<std::size_t>(conversion.input.recordCount(variable.source));
}

void copyVariable(Conversion& conversion, const Copied& variable, Progress& progress) {
  const std::size_t records = countRecords(conversion, variable);
  requireIndexed(conversion.input, variable.source, static_cast<double>(records));
  SparseFilter filter(conversion.input, variable.source, records);
  SlabPlan plan(variable.source, 0, records);
  const bool transposes = conversion.transposes && variable.source.sizes.size() > 1;
  while (const auto slab = plan.next()) {
    Array data = conversion.input.read(variable.source, *slab);
    progress.advance(data.elementCount());
    const bool whole = slab->count == variable.source.sizes;
    const std::size_t count = data.elementCount();
    if (transposes) data = transposed(data, *slab);
    const Slab target = transposes ? reversed(*slab) : *slab;
    if (filter.active() && whole && count > 0) {
      writeStored(conversion.output, variable.target, target, data, filter);
    } else {
      conversion.output.write(variable.target, target, data);
    }
  }
}

}  // namespace

void copyData(Conversion& conversion) {
  std::size_t total = 0;
  for (const Copied& variable : conversion.variables)
    total += countRecords(conversion, variable) * variable.source.recordElements();
  Progress progress("Converting", total, errorIsTerminal());
  for (const Copied& variable : conversion.variables)
    copyVariable(conversion, variable, progress);
}

}  // namespace ambrix::tool
