#include "fuzz/files/whole_read.h"

#include <fmt/format.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <initializer_list>
#include <span>
#include <stdexcept>
#include <string_view>
#include <utility>
#include <vector>

namespace ambrix::fuzz {
namespace {

constexpr double kMostNumbers = 200;       // of variables, attributes or entries
constexpr double kMostElements = 1 << 20;  // of one read

constexpr const char* kOfFile[] = {"inquire",
                                   "getCacheSize",
                                   "getChecksum",
                                   "getCompression",
                                   "getFormat",
                                   "getCopyright",
                                   "getMajority",
                                   "getCompressionCacheSize",
                                   "getName",
                                   "getNumgAttributes",
                                   "getNumvAttributes",
                                   "getReadOnlyMode",
                                   "getVersion",
                                   "getStageCacheSize",
                                   "getVarsMaxWrittenRecNum"};
constexpr const char* kOfVariable[] = {
    "inquireVar",           "getVarAllocRecords",   "getVarBlockingFactor",   "getVarName",
    "getVarCompression",    "getVarMaxAllocRecNum", "getVarMaxWrittenRecNum", "getVarPadValue",
    "getVarNumRecsWritten", "getVarSparseRecords"};
constexpr const char* kOfAttribute[] = {"getAttrName", "getAttrScope"};

/// Errors that a damaged file may raise; any other is a fault of the module.
bool isExpected(const Error& error) {
  constexpr std::array kExpected = {"TOLVEX:ambrix:cdflib:libraryFailure",
                                    "TOLVEX:ambrix:cdflib:unrecognizedValue",
                                    "TOLVEX:ambrix:cdflib:dimSizeTooLarge",
                                    "TOLVEX:ambrix:cdflib:badDimSpec",
                                    "TOLVEX:ambrix:cdflib:cannotOmitDimSpec",
                                    "TOLVEX:host:outOfMemory",
                                    "TOLVEX:host:badDimension"};
  return std::ranges::find(kExpected, error.identifier()) != kExpected.end();
}

class WholeRead {
 public:
  WholeRead(Module& module, Array id) : module_(module), id_(std::move(id)) {}

  void run() {
    for (const char* command : kOfFile)
      call(command, {});
    const double variables = numberOf(call("inquire", {}), 3);
    for (double number = 0; number < std::min(variables, kMostNumbers); ++number)
      readVariable(number);
    const double attributes =
        numberOf(call("getNumgAttributes", {}), 0) + numberOf(call("getNumvAttributes", {}), 0);
    for (double number = 0; number < std::min(attributes, kMostNumbers); ++number)
      readAttribute(number);
    call("close", {});
  }
  [[nodiscard]] bool failed() const { return failed_; }

 private:
  std::vector<Array> call(const char* command, std::initializer_list<double> numbers);
  std::vector<Array> callWith(const char* command, std::vector<Array> arguments);
  static double numberOf(const std::vector<Array>& results, std::size_t index);
  void readVariable(double number);
  void readRecords(double number, double records, std::span<const double> sizes, double elements);
  void readAttribute(double number);

  Module& module_;
  Array id_;
  bool failed_ = false;
};

std::vector<Array> WholeRead::call(const char* command, std::initializer_list<double> numbers) {
  std::vector<Array> arguments;
  for (const double number : numbers)
    arguments.push_back(Array::scalar(number));
  return callWith(command, std::move(arguments));
}

std::vector<Array> WholeRead::callWith(const char* command, std::vector<Array> arguments) try {
  std::vector<ArrayView> all = {id_};
  all.insert(all.end(), arguments.begin(), arguments.end());
  return module_.call(command, std::span<const ArrayView>(all));
} catch (const Error& error) {
  if (!isExpected(error)) throw;
  failed_ = true;
  return {};
}

/// A result, or 0 when the call has failed.
double WholeRead::numberOf(const std::vector<Array>& results, std::size_t index) {
  return results.empty() ? 0 : results.at(index).data<double>().front();
}

void WholeRead::readVariable(double number) {
  for (const char* command : kOfVariable)
    call(command, {number});
  const std::vector<Array> facts = call("inquireVar", {number});
  if (facts.empty()) return;
  const double records = numberOf(call("getVarMaxWrittenRecNum", {number}), 0) + 1;
  readRecords(number, records, facts.at(3).data<double>(), numberOf(facts, 2));
  for (const double record : {0.0, std::floor(records / 2), records - 1})
    call("getVarRecordData", {number, record});
  std::vector<Array> value;
  value.push_back(Array::scalar(number));
  value.push_back(Array::scalar(0.0));
  value.push_back(Array::zeros(ClassId::kDouble, {1, facts.at(3).elementCount()}));
  callWith("getVarData", std::move(value));
}

/// All records, but for what a damaged count adds to them.
void WholeRead::readRecords(double number, double records, std::span<const double> sizes,
                            double elements) {
  double perRecord = std::max(elements, 1.0);
  for (const double size : sizes)
    perRecord *= std::max(size, 1.0);
  const double count = std::min(records, std::max(1.0, std::floor(kMostElements / perRecord)));
  std::vector<Array> slab;
  for (const double argument : {number, 0.0, count, 1.0})
    slab.push_back(Array::scalar(argument));
  slab.push_back(Array::zeros(ClassId::kDouble, {1, sizes.size()}));
  slab.push_back(Array::row(sizes));
  slab.push_back(Array::row(std::span<const double>(std::vector<double>(sizes.size(), 1))));
  callWith("hyperGetVarData", std::move(slab));
}

void WholeRead::readAttribute(double number) {
  for (const char* command : kOfAttribute)
    call(command, {number});
  const std::vector<Array> facts = call("inquireAttr", {number});
  if (facts.empty()) return;
  const bool global = facts.at(1).utf8() == "GLOBAL_SCOPE";
  const double last = numberOf(facts, global ? 2 : 3);
  call(global ? "getNumAttrgEntries" : "getNumAttrEntries", {number});
  call(global ? "getAttrMaxgEntry" : "getAttrMaxEntry", {number});
  for (double entry = 0; entry <= std::min(last, kMostNumbers); ++entry) {
    call(global ? "inquireAttrgEntry" : "inquireAttrEntry", {number, entry});
    call(global ? "getAttrgEntry" : "getAttrEntry", {number, entry});
  }
}

void requireNothingAlive() {
  const LiveCounts live = liveCounts();
  if (live == LiveCounts{}) return;
  throw std::logic_error(
      fmt::format("{} arrays and {} scratch buffers are left", live.arrays, live.scratch));
}

void setValidation(Module& module, bool on) {
  const auto name = Array::fromNarrow(on ? "VALIDATEFILEON" : "VALIDATEFILEOFF");
  module.call("setValidate", module.call("getConstantValue", {name}));
}

Reading readOpened(Module& module, const std::string& path) try {
  WholeRead read(module, std::move(module.call("open", {Array::fromUtf8(path)}).at(0)));
  read.run();
  return read.failed() ? Reading::kWithErrors : Reading::kWhole;
} catch (const Error& error) {
  // The mode that comes after opening can fail, too.
  const bool refused = error.identifier() == "TOLVEX:ambrix:cdflib:fileOpenError";
  if (!refused && error.identifier() != "TOLVEX:ambrix:cdflib:libraryFailure") throw;
  return Reading::kRefused;
}

}  // namespace

Reading readWhole(Module& module, const std::string& path, bool validated) {
  setValidation(module, validated);
  const Reading reading = readOpened(module, path);
  requireNothingAlive();
  return reading;
}

}  // namespace ambrix::fuzz
