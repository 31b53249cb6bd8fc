// Indices, counts and data that suit the variable of the call.
#include <algorithm>

#include "fuzz/calls/argument_maker.h"

namespace ambrix_fuzz {
namespace {

// More would cost time and show nothing: a count beyond it is a wrong count.
constexpr std::size_t kMostElements = 1 << 14;

std::size_t limited(std::size_t a, std::size_t b) {
  std::size_t product = 0;
  const bool wraps = __builtin_mul_overflow(a, b, &product);
  return wraps ? kMostElements : std::min(product, kMostElements);
}

std::size_t valuesPerRecord(const Variable& variable) {
  std::size_t product = 1;
  for (const long size : variable.sizes)
    product = limited(product, static_cast<std::size_t>(std::max(size, 0L)));
  return product;
}

/// Numbers for the dimensions of a variable; empty for a scalar one.
template <typename Number>
Array perDimension(const Variable& variable, const Number& number) {
  const std::size_t count = variable.sizes.size();
  Array numbers = Array::zeros(ClassId::kDouble, {count == 0 ? 0UL : 1UL, count});
  for (std::size_t i = 0; i < count; ++i)
    numbers.mutableData<double>()[i] = static_cast<double>(number(i));
  return numbers;
}

/// A dimension's size, within what a choice can be made of.
std::size_t sizeOf(const Variable& variable, std::size_t dimension) {
  return static_cast<std::size_t>(std::clamp(variable.sizes[dimension], 1L, 256L));
}

/// Of values of a datatype that is not supported, doubles.
ClassId classToWrite(long datatype) {
  const ClassId known = classOfDatatype(datatype);
  return known == ClassId::kUnknown ? ClassId::kDouble : known;
}

}  // namespace

Array ArgumentMaker::indices() {
  start_.clear();
  return perDimension(variable_, [this](std::size_t i) {
    start_.push_back(choices_.below(sizeOf(variable_, i)));
    return start_.back();
  });
}

Array ArgumentMaker::counts() {
  slabValues_ = 1;
  return perDimension(variable_, [this](std::size_t i) {
    const std::size_t size = sizeOf(variable_, i);
    const std::size_t most = i < start_.size() && start_[i] < size ? size - start_[i] : 1;
    const std::size_t count = 1 + choices_.below(most);
    slabValues_ = limited(slabValues_, count);
    return count;
  });
}

Array ArgumentMaker::intervals() {
  return perDimension(variable_, [this](std::size_t) { return choices_.oneIn(6) ? 2 : 1; });
}

Array ArgumentMaker::recordCount() {
  slabRecords_ = 1 + choices_.below(4);
  return Array::scalar(static_cast<double>(slabRecords_));
}

std::size_t ArgumentMaker::valueElements() const {
  if (variable_.datatype == 32) return 2;
  const long elements = isText(variable_.datatype) ? variable_.elements : 1;
  return static_cast<std::size_t>(std::max(elements, 0L));
}

Array ArgumentMaker::variableData(std::size_t values) {
  return valuesOf(choices_, classToWrite(variable_.datatype), limited(values, valueElements()));
}

Array ArgumentMaker::value() {
  return variableData(1);
}
Array ArgumentMaker::record() {
  return variableData(valuesPerRecord(variable_));
}
Array ArgumentMaker::slab() {
  return variableData(limited(slabValues_, slabRecords_));
}

Array ArgumentMaker::entryValue() {
  const std::size_t values = 1 + choices_.below(6);
  return valuesOf(choices_, classToWrite(datatype_), datatype_ == 32 ? 2 * values : values);
}

Array ArgumentMaker::compressionType() {
  constexpr long kTypes[] = {0, 1, 2, 3, 5};
  compression_ = choices_.pick(kTypes);
  return Array::scalar(static_cast<double>(compression_));
}

Array ArgumentMaker::compressionParameter() {
  return Array::scalar(compression_ == 5 ? static_cast<double>(1 + choices_.below(9)) : 0.0);
}

Array ArgumentMaker::timeComponents() {
  Array times = Array::zeros(ClassId::kDouble, {7, choices_.below(4)});
  for (double& component : times.mutableData<double>())
    component = 1.0 + static_cast<double>(choices_.below(12));
  return times;
}

Array ArgumentMaker::time16Components() {
  Array times = Array::zeros(ClassId::kDouble, {10, choices_.below(4)});
  for (double& component : times.mutableData<double>())
    component = 1.0 + static_cast<double>(choices_.below(12));
  return times;
}

Array ArgumentMaker::times() {
  return valuesOf(choices_, ClassId::kDouble, choices_.below(5));
}

Array ArgumentMaker::times16() {
  Array times = Array::zeros(ClassId::kDouble, {2, choices_.below(3), 1 + choices_.below(2)});
  for (double& part : times.mutableData<double>())
    part = static_cast<double>(choices_.word() >> 4);
  return times;
}

Array ArgumentMaker::timeTt2000Components() {
  constexpr double kFirstYear = 1700;
  Array times = Array::zeros(ClassId::kDouble, {9, choices_.below(4)});
  std::size_t i = 0;
  for (double& component : times.mutableData<double>()) {
    const bool isYear = i++ % 9 == 0;
    component = isYear ? kFirstYear + static_cast<double>(choices_.below(600))
                       : 1.0 + static_cast<double>(choices_.below(12));
  }
  return times;
}

Array ArgumentMaker::timesTt2000() {
  return valuesOf(choices_, ClassId::kInt64, choices_.below(5));
}

}  // namespace ambrix_fuzz
