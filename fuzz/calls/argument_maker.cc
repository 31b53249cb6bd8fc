#include "fuzz/calls/argument_maker.h"

#include <algorithm>
#include <iterator>
#include <string>

#include "fuzz/calls/backend.h"

namespace ambrix_fuzz {
namespace {

/// Arguments that depend on nothing: a letter and the numbers from which one is chosen.
struct Numbers {
  char letter;
  std::vector<double> values;
};

const Numbers kNumbersByLetter[] = {
    {'e', {0, 1, 2, 3}},                           // entry
    {'r', {0, 1, 2, 3, 4, 5, 9, 17, 2147483647}},  // record; the last has no place in a count
    {'t', {1, 2}},                                 // record interval
    {'g', {1, 2}},                                 // scope or majority
    {'F', {1, 1, 1, 2}},                           // format
    {'b', {0, 1, 2, 5, 16, 100}},                  // how many or how much
    {'C', {0, 1, 0, 1, 2}},                        // checksum
    {'O', {0, -1}},                                // read-only, validation
    {'B', {0, 0, 0, 1}},                           // backward files
    {'s', {0, 1, 2}},                              // sparse records
};

constexpr const char* kFileNames[] = {"f0", "f1", "f2", "f3.cdf", "long-name-of-a-file"};
constexpr const char* kOddFileNames[] = {"missing", "", ".", "empty", "text.cdf", "nofolder/f"};
constexpr long kDatatypeCodes[] = {22, 4, 51, 32, 1, 2, 11, 12, 14, 21, 31, 41, 44, 45, 52};
constexpr const char* kConstants[] = {"VARY",       "CDF_INT4",         "cdf_epoch16",
                                      "READONLYon", "GZIP_COMPRESSION", "RLE_OF_ZEROs"};

std::string numbered(const char* stem, std::size_t number) {
  return stem + std::to_string(number);
}

Array row(const std::vector<double>& values) {
  if (values.empty()) return Array::zeros(ClassId::kDouble, {0, 0});
  return Array::row<double>(std::span<const double>(values));
}

double asDouble(std::size_t number) {
  return static_cast<double>(number);
}

}  // namespace

std::vector<Array> ArgumentMaker::argumentsOf(const Command& command) {
  std::vector<Array> arguments;
  for (const char* letter = command.arguments; *letter != '\0'; ++letter) {
    if (*letter != '?') {
      arguments.push_back(makeArgument(*letter));
    } else if (choices_.oneIn(3)) {
      break;
    }
  }
  return arguments;
}

Array ArgumentMaker::makeArgument(char letter) {
  const auto* numbers = std::ranges::find_if(
      kNumbersByLetter, [letter](const Numbers& row) { return row.letter == letter; });
  if (numbers != std::end(kNumbersByLetter)) return Array::scalar(choices_.pick(numbers->values));
  return (this->*makerOf(letter))();
}

ArgumentMaker::Maker ArgumentMaker::makerOf(char letter) {
  using M = ArgumentMaker;
  struct Row {
    char letter;
    Maker maker;
  };
  static constexpr Row kMakers[] = {
      {'f', &M::file},
      {'o', &M::fileToOpen},
      {'c', &M::fileToCreate},
      {'v', &M::variable},
      {'V', &M::variableName},
      {'A', &M::attributeName},
      {'w', &M::newName},
      {'N', &M::constantName},
      {'a', &M::attribute},
      {'d', &M::datatype},
      {'n', &M::numberOfElements},
      {'D', &M::dimensions},
      {'R', &M::recordVariance},
      {'S', &M::dimensionVariances},
      {'i', &M::indices},
      {'I', &M::indices},
      {'K', &M::counts},
      {'T', &M::intervals},
      {'k', &M::recordCount},
      {'x', &M::value},
      {'X', &M::record},
      {'H', &M::slab},
      {'E', &M::entryValue},
      {'z', &M::compressionType},
      {'Z', &M::compressionParameter},
      {'7', &M::timeComponents},
      {'0', &M::time16Components},
      {'1', &M::times},
      {'2', &M::times16},
  };
  const auto* found =
      std::ranges::find_if(kMakers, [letter](const Row& row) { return row.letter == letter; });
  return found->maker;
}

Array ArgumentMaker::file() {
  if (world_.files().empty()) return Array::scalar(std::uint64_t{1});
  file_ = &world_.files()[choices_.below(world_.files().size())];
  return Array::scalar(file_->id);
}

Array ArgumentMaker::fileToOpen() {
  return text(choices_.oneIn(8) ? choices_.pick(kOddFileNames) : choices_.pick(kFileNames));
}

Array ArgumentMaker::fileToCreate() {
  return fileToOpen();
}

Array ArgumentMaker::variable() {
  std::size_t number = 0;
  if (file_ != nullptr && !file_->contents.variables.empty()) {
    number = choices_.below(file_->contents.variables.size());
    variable_ = file_->contents.variables[number];
  }
  variable_ = scriptedVariable().value_or(variable_);
  return Array::scalar(asDouble(number));
}

Array ArgumentMaker::variableName() {
  return text(numbered("v", choices_.below(4)));
}
Array ArgumentMaker::attributeName() {
  return text(numbered("v", choices_.below(4)));
}
Array ArgumentMaker::newName() {
  return text(numbered("v", choices_.below(8)));
}
Array ArgumentMaker::constantName() {
  return text(choices_.pick(kConstants));
}

Array ArgumentMaker::attribute() {
  const std::size_t attributes = file_ == nullptr ? 0 : file_->contents.attributes;
  return Array::scalar(asDouble(choices_.below(std::max<std::size_t>(attributes, 1))));
}

Array ArgumentMaker::datatype() {
  datatype_ = choices_.pick(kDatatypeCodes);
  return Array::scalar(static_cast<double>(datatype_));
}

Array ArgumentMaker::numberOfElements() {
  return Array::scalar(isText(datatype_) ? asDouble(1 + choices_.below(8)) : 1.0);
}

Array ArgumentMaker::dimensions() {
  dimensions_ = choices_.below(4);
  std::vector<double> sizes;
  for (std::size_t i = 0; i < dimensions_; ++i)
    sizes.push_back(asDouble(1 + choices_.below(5)));
  return row(sizes);
}

Array ArgumentMaker::recordVariance() {
  return Array::scalar(!choices_.oneIn(5));
}

Array ArgumentMaker::dimensionVariances() {
  std::vector<double> variances;
  for (std::size_t i = 0; i < dimensions_; ++i)
    variances.push_back(choices_.oneIn(6) ? 0.0 : -1.0);
  return row(variances);
}

}  // namespace ambrix_fuzz
