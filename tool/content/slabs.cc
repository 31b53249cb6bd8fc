#include "tool/content/slabs.h"

#include <algorithm>
#include <functional>
#include <numeric>

#include "tool/content/values.h"
#include "tool/output/text.h"
#include "tool/supervision/steps.h"

namespace ambrix::tool {
namespace {

constexpr std::size_t kElementsAtOnce = 1 << 20;

Array rowOf(const std::vector<std::size_t>& numbers) {
  const std::vector<double> values(numbers.begin(), numbers.end());
  return Array::row(std::span<const double>(values));
}

}  // namespace

std::size_t Slab::values() const {
  return std::accumulate(count.begin(), count.end(), records, std::multiplies<>());
}

SlabPlan::SlabPlan(const Variable& variable, std::size_t firstRecord, std::size_t endRecord)
    : sizes_(variable.sizes), record_(firstRecord), endRecord_(endRecord) {
  const std::size_t elements = std::max<std::size_t>(variable.recordElements(), 1);
  split_ = elements > kElementsAtOnce && !sizes_.empty();
  recordsAtOnce_ = std::max<std::size_t>(kElementsAtOnce / elements, 1);
  position_.assign(sizes_.size(), 0);
  if (split_) planRecord(variable);
}

void SlabPlan::planRecord(const Variable& variable) {
  std::size_t span = hostElements(variable.datatype, variable.elements);
  while (splitDimension_ + 1 < sizes_.size() && span * sizes_[splitDimension_] <= kElementsAtOnce)
    span *= sizes_[splitDimension_++];
  step_ = std::max<std::size_t>(kElementsAtOnce / span, 1);
}

std::optional<Slab> SlabPlan::next() {
  if (record_ >= endRecord_) return std::nullopt;
  return split_ ? partOfRecord() : wholeRecords();
}

Slab SlabPlan::wholeRecords() {
  const std::size_t records = std::min(recordsAtOnce_, endRecord_ - record_);
  Slab slab{record_, records, position_, sizes_};
  record_ += records;
  return slab;
}

Slab SlabPlan::partOfRecord() {
  Slab slab{record_, 1, position_, sizes_};
  const std::size_t left = sizes_[splitDimension_] - position_[splitDimension_];
  slab.count[splitDimension_] = std::min(step_, left);
  std::fill(slab.count.begin() + static_cast<std::ptrdiff_t>(splitDimension_) + 1, slab.count.end(),
            1);
  position_[splitDimension_] += slab.count[splitDimension_];
  advance();
  return slab;
}

/// Carries from a dimension that is done to the next, and in the end to the next record.
void SlabPlan::advance() {
  for (std::size_t i = splitDimension_; position_[i] >= sizes_[i];) {
    position_[i] = 0;
    if (++i == sizes_.size()) {
      ++record_;
      return;
    }
    ++position_[i];
  }
}

std::vector<Array> slabArguments(const Variable& variable, const Slab& slab) {
  std::vector<Array> arguments;
  const double records[] = {variable.number, static_cast<double>(slab.firstRecord),
                            static_cast<double>(slab.records), 1};
  for (const double number : records)
    arguments.push_back(Array::scalar(number));
  arguments.push_back(rowOf(slab.start));
  arguments.push_back(rowOf(slab.count));
  arguments.push_back(rowOf(std::vector<std::size_t>(slab.count.size(), 1)));
  return arguments;
}

Array readSlab(CdfFile& file, const Variable& variable, const Slab& slab) {
  beginStep("reading variable \"" + printable(variable.name) + '"');
  const std::vector<Array> arguments = slabArguments(variable, slab);
  const std::vector<ArrayView> views(arguments.begin(), arguments.end());
  return std::move(file.call("hyperGetVarData", views).at(0));
}

void writeSlab(CdfFile& file, const Variable& variable, const Slab& slab, ArrayView data) {
  const std::vector<Array> arguments = slabArguments(variable, slab);
  std::vector<ArrayView> views(arguments.begin(), arguments.end());
  views.push_back(data);
  file.call("hyperPutVarData", views);
}

std::size_t countRecords(CdfFile& file, const Variable& variable) {
  const double last = file.number("getVarMaxWrittenRecNum", {variable.number});
  return static_cast<std::size_t>(last + 1);
}

}  // namespace ambrix::tool
