#include "fuzz/calls/argument_maker.h"

#include <algorithm>
#include <iterator>
#include <string>

#include "fuzz/calls/backend.h"

namespace ambrix_fuzz {
namespace {

/// Arguments that depend on nothing: a kind and the numbers from which one is chosen.
struct Numbers {
  const char* kind;
  std::vector<double> values;
};

const Numbers kNumbersByKind[] = {
    {"entry", {0, 1, 2, 3}},
    {"record", {0, 1, 2, 3, 4, 5, 9, 17, 2147483647}},  // the last has no place in a count
    {"stride", {1, 2}},
    {"scope", {1, 2}},
    {"majority", {1, 2}},
    {"format", {1, 1, 1, 2}},
    {"amount", {0, 1, 2, 5, 16, 100}},
    {"checksum", {0, 1, 0, 1, 2}},
    {"mode", {0, -1}},
    {"backward", {0, 0, 0, 1}},
    {"sparseness", {0, 1, 2}},
};

constexpr const char* kFileNames[] = {"f0", "f1", "f2", "f3.cdf", "long-name-of-a-file"};
constexpr const char* kOddFileNames[] = {"missing", "", ".", "empty", "text.cdf", "nofolder/f"};
constexpr const char* kConstants[] = {"VARY",           "CDF_INT4",         "cdf_epoch16",
                                      "READONLYon",     "GZIP_COMPRESSION", "RLE_OF_ZEROs",
                                      "CDF_TIME_TT2000"};

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
  for (const ambrix_test::Argument& argument : command.arguments) {
    if (argument.optional && choices_.oneIn(3)) break;
    arguments.push_back(makeArgument(argument.kind));
  }
  return arguments;
}

Array ArgumentMaker::makeArgument(std::string_view kind) {
  const auto* numbers = std::ranges::find(kNumbersByKind, kind, &Numbers::kind);
  if (numbers != std::end(kNumbersByKind)) return Array::scalar(choices_.pick(numbers->values));
  return (this->*makerOf(kind))();
}

ArgumentMaker::Maker ArgumentMaker::makerOf(std::string_view kind) {
  using M = ArgumentMaker;
  struct Row {
    std::string_view kind;
    Maker maker;
  };
  static constexpr Row kMakers[] = {
      {"file", &M::file},
      {"path", &M::path},
      {"variable", &M::variable},
      {"variableName", &M::variableName},
      {"attributeName", &M::attributeName},
      {"newName", &M::newName},
      {"constantName", &M::constantName},
      {"attribute", &M::attribute},
      {"datatype", &M::datatype},
      {"elements", &M::numberOfElements},
      {"sizes", &M::dimensions},
      {"variance", &M::recordVariance},
      {"variances", &M::dimensionVariances},
      {"indices", &M::indices},
      {"start", &M::indices},
      {"counts", &M::counts},
      {"strides", &M::intervals},
      {"records", &M::recordCount},
      {"value", &M::value},
      {"recordValues", &M::record},
      {"slabValues", &M::slab},
      {"entryValues", &M::entryValue},
      {"compression", &M::compressionType},
      {"parameter", &M::compressionParameter},
      {"components", &M::timeComponents},
      {"components16", &M::time16Components},
      {"components9", &M::timeTt2000Components},
      {"nanoseconds", &M::timesTt2000},
      {"epochs", &M::times},
      {"epochs16", &M::times16},
  };
  return std::ranges::find(kMakers, kind, &Row::kind)->maker;
}

Array ArgumentMaker::file() {
  if (world_.files().empty()) return Array::scalar(std::uint64_t{1});
  file_ = &world_.files()[choices_.below(world_.files().size())];
  return Array::scalar(file_->id);
}

Array ArgumentMaker::path() {
  return text(choices_.oneIn(8) ? choices_.pick(kOddFileNames) : choices_.pick(kFileNames));
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
  datatype_ = anyDatatype(choices_);
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
