#include <algorithm>
#include <functional>
#include <numeric>

#include "ambrix/variable.h"

namespace ambrix {
namespace {

constexpr std::size_t kElementsAtOnce = 1 << 20;

}  // namespace

std::size_t Variable::valueElements() const noexcept {
  return elementsPerValue(datatype, elements);
}

std::size_t Variable::recordElements() const noexcept {
  return std::accumulate(sizes.begin(), sizes.end(), valueElements(), std::multiplies<>());
}

Slab Slab::ofRecords(const Variable& variable, std::size_t first, std::size_t records,
                     std::size_t recordStep) {
  return {first, records, std::vector<std::size_t>(variable.sizes.size()), variable.sizes,
          recordStep};
}

std::size_t Slab::values() const noexcept {
  return std::accumulate(count.begin(), count.end(), records, std::multiplies<>());
}

std::size_t Slab::elements(const Variable& variable) const noexcept {
  return values() * variable.valueElements();
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
  std::size_t span = variable.valueElements();
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

}  // namespace ambrix
