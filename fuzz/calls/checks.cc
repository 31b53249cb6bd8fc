#include "fuzz/calls/checks.h"

#include <algorithm>
#include <iterator>
#include <set>
#include <string_view>
#include <variant>

#include "fuzz/calls/call_log.h"
#include "fuzz/calls/mode.h"
#include "fuzz/calls/values.h"
#include "gateway/open_file_registry.h"
#include "tests/support/known_messages.h"

namespace ambrix_fuzz {
namespace {

constexpr std::size_t kMostDimensions = 10;
constexpr std::size_t kMostStatusText = 200;

std::string kindsOf(const std::vector<ambrix::MessageArg>& values) {
  std::string kinds;
  for (const ambrix::MessageArg& value : values)
    kinds += "itu"[value.index()];
  return kinds;
}

/// An identifier and the kinds of its values: i for integer, t for narrow text.
struct KnownError {
  std::string identifier;
  std::string values;
};

/// The last one stands for the exception without identifier.
const std::vector<KnownError>& errors() {
  static const auto kErrors = [] {
    std::vector<KnownError> known;
    for (const auto& message : ambrix_test::knownMessages()) {
      // What this host would not catch.
      if (message.id.identifier == "unexpectedFailure") continue;
      known.push_back({message.id.fullIdentifier(), kindsOf(message.id.values)});
    }
    known.push_back({"not text", ""});
    return known;
  }();
  return kErrors;
}

bool isMatrix(ArrayView array, ClassId classId, std::size_t rows) {
  return array.classId() == classId && array.size().size() == 2 && array.size()[0] == rows;
}

bool isScalar(ArrayView array, ClassId classId) {
  return isMatrix(array, classId, 1) && array.elementCount() == 1;
}

bool isEmptyMatrix(ArrayView array, ClassId classId) {
  return isMatrix(array, classId, 0) && array.size()[1] == 0;
}

bool isLine(ArrayView array) {
  return isMatrix(array, ClassId::kChar, 1) || isEmptyMatrix(array, ClassId::kChar);
}

bool isPerDimension(ArrayView array, ClassId classId) {
  const bool row = isMatrix(array, classId, 1) && array.elementCount() > 0;
  return (row || isEmptyMatrix(array, classId)) && array.elementCount() <= kMostDimensions;
}

bool isNames(ArrayView array) {
  const std::size_t count = isExtended() ? 59 : 57;
  if (!isMatrix(array, ClassId::kCell, count) || array.elementCount() != count) return false;
  for (std::size_t i = 0; i < count; ++i) {
    if (!array.element(i) || !isLine(array.element(i))) return false;
  }
  return true;
}

bool isValue(ArrayView array) {
  constexpr ClassId kNever[] = {ClassId::kUnknown, ClassId::kCell, ClassId::kLogical,
                                ClassId::kUint64};
  if (array.classId() == ClassId::kInt64) return isExtended();
  return std::ranges::find(kNever, array.classId()) == std::end(kNever);
}

bool isParameter(ArrayView array) {  // of a compression
  return isLine(array) || isScalar(array, ClassId::kDouble) ||
         isEmptyMatrix(array, ClassId::kDouble);
}

/// What the results of a kind are.
struct Kind {
  std::string_view name;
  bool (*isSane)(ArrayView);
};

constexpr Kind kKinds[] = {
    {"file", [](ArrayView array) { return isScalar(array, ClassId::kUint64); }},
    {"number", [](ArrayView array) { return isScalar(array, ClassId::kDouble); }},
    {"text", isLine},
    {"row", [](ArrayView array) { return isPerDimension(array, ClassId::kDouble); }},
    {"logical", [](ArrayView array) { return isScalar(array, ClassId::kLogical); }},
    {"logicals", [](ArrayView array) { return isPerDimension(array, ClassId::kLogical); }},
    {"names", isNames},
    {"parameter", isParameter},
    {"values", isValue},
    {"epochs", [](ArrayView array) { return isMatrix(array, ClassId::kDouble, 1); }},
    {"epochs16", [](ArrayView array) { return isMatrix(array, ClassId::kDouble, 2); }},
    {"components", [](ArrayView array) { return isMatrix(array, ClassId::kDouble, 7); }},
    {"nanoseconds", [](ArrayView array) { return isMatrix(array, ClassId::kInt64, 1); }},
    {"components9", [](ArrayView array) { return isMatrix(array, ClassId::kDouble, 9); }},
    {"components16",  // over any further dimensions
     [](ArrayView array) { return array.classId() == ClassId::kDouble && array.size()[0] == 10; }},
};

bool isSane(std::string_view kind, ArrayView array) {
  return std::ranges::find(kKinds, kind, &Kind::name)->isSane(array);
}

std::size_t valuesWanted(std::string_view command, const std::vector<Array>& arguments,
                         const Variable& variable) {
  std::size_t values = 1;
  if (command == "getVarRecordData") {
    for (const long size : variable.sizes)
      values *= static_cast<std::size_t>(size);
  }
  if (command != "hyperGetVarData") return values;
  for (const double count : arguments[6].data<double>())
    values *= static_cast<std::size_t>(std::max(count, 0.0));
  return values * static_cast<std::size_t>(std::max(arguments[3].data<double>()[0], 0.0));
}

std::size_t arraysIn(ArrayView array) {
  std::size_t count = 1;
  if (array.classId() != ClassId::kCell) return count;
  for (std::size_t i = 0; i < array.elementCount(); ++i)
    count += array.element(i) ? arraysIn(array.element(i)) : 0;
  return count;
}

}  // namespace

std::size_t knownErrors() {
  return errors().size();
}

const char* errorName(std::size_t place) {
  return errors()[place].identifier.c_str();
}

std::size_t placeOfNotText() {
  return errors().size() - 1;
}

std::size_t requireKnown(const ambrix::MessageId& error) {
  const std::string identifier = error.fullIdentifier();
  const auto found = std::ranges::find(errors(), identifier, &KnownError::identifier);
  if (found == errors().end()) violation("no such error: " + identifier);
  const std::string kinds = kindsOf(error.values);
  if (kinds != found->values) violation(identifier + " with values of kinds " + kinds);
  if (identifier.ends_with("libraryFailure")) {
    const auto& routine = std::get<std::string>(error.values[0]);
    const auto& text = std::get<std::string>(error.values[1]);
    const bool sane = routine.starts_with("CDF") && text.size() <= kMostStatusText;
    if (!sane) violation("libraryFailure of " + routine + ": " + text);
  }
  return static_cast<std::size_t>(found - errors().begin());
}

void requireSane(const ambrix_test::Command& command, const std::vector<Array>& results,
                 std::size_t outputs) {
  const std::vector<std::string>& expected = command.results;
  if (results.size() != std::min(outputs, expected.size())) {
    violation(command.name + " has " + std::to_string(results.size()) + " results");
  }
  for (std::size_t i = 0; i < results.size(); ++i) {
    if (isSane(expected[i], results[i])) continue;
    violation(command.name + " returns " + shown(results[i]));
  }
}

void requireFitting(std::string_view command, const std::vector<Array>& arguments, ArrayView value,
                    const Variable& variable) {
  const bool text = isText(variable.datatype);
  if (!text && variable.elements != 1) return;  // which no sane file has
  const bool hyper = command == "hyperGetVarData";
  if (hyper && arguments[6].classId() != ClassId::kDouble) return;  // counts of some other class
  const auto perValue = static_cast<std::size_t>(text ? variable.elements : 1);
  const std::size_t parts = variable.datatype == 32 ? 2 : perValue;
  const std::size_t expected = parts * valuesWanted(command, arguments, variable);
  const bool fits =
      value.classId() == classOfDatatype(variable.datatype) && value.elementCount() == expected;
  if (fits) return;
  violation(std::string(command) + " returns " + shown(value) + " for " + std::to_string(expected) +
            " elements of datatype " + std::to_string(variable.datatype));
}

void requireNothingLeft(const ambrix::LiveCounts& before, const std::vector<Array>& results) {
  ambrix::LiveCounts expected = before;
  for (const Array& result : results)
    expected.arrays += arraysIn(result);
  const ambrix::LiveCounts now = ambrix::liveCounts();
  if (now == expected) return;
  violation("alive: " + std::to_string(now.arrays) + " arrays of " +
            std::to_string(expected.arrays) + ", " + std::to_string(now.scratch) +
            " scratch buffers of " + std::to_string(expected.scratch));
}

void requireOpen(const World& world) {
  std::set<std::uint64_t> open;
  for (const TOLVEX::ambrix::CdfId file : TOLVEX::ambrix::openFileRegistry().files())
    open.insert(static_cast<std::uint64_t>(file));
  if (open != world.openIds()) {
    violation("the registry has " + std::to_string(open.size()) + " files, not the " +
              std::to_string(world.openIds().size()) + " that are open");
  }
}

}  // namespace ambrix_fuzz
