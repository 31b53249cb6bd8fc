#include "fuzz/calls/sequence.h"

#include <algorithm>
#include <exception>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "adapters/embedded/array_object.h"
#include "fuzz/calls/argument_maker.h"
#include "fuzz/calls/backend.h"
#include "fuzz/calls/call_log.h"
#include "fuzz/calls/checks.h"
#include "fuzz/calls/mode.h"
#include "fuzz/calls/mutation.h"
#include "fuzz/calls/transcript.h"
#include "gateway/open_file_registry.h"
#include "host/qvh.h"
#include "tests/support/command_signatures.h"

namespace ambrix_fuzz {
namespace {

using ambrix_test::commands;
using ambrix_test::extendedCommands;
using ambrix_test::placeOf;

constexpr std::size_t kByteLimit = 1 << 24;

/// What most sequences begin with, so that there is something to work on.
constexpr const char* kBeginnings[] = {"create",    "setFormat",           "setMajority",
                                       "createVar", "setVarSparseRecords", "createAttr",
                                       "createVar", "setVarCompression"};
/// What a world needs more of than of others.
constexpr const char* kFrequent[] = {
    "create",
    "open",
    "createVar",
    "createAttr",
    "putAttrEntry",
    "putAttrgEntry",
    "putVarData",
    "hyperPutVarData",
    "putVarRecordData",
    "hyperGetVarData",
    "getAttrEntry",
    "getVarRecordData",
    "setMajority",
    "setVarCompression",
    "close",
};

bool outputsFilled = false;

/// The module's entry point; notes whether a call that fails has filled an output.
void watchedEntryPoint(int outputCount, qvArray* outputs[], int inputCount,
                       const qvArray* inputs[]) {
  outputsFilled = false;
  try {
    qvhFunction(outputCount, outputs, inputCount, inputs);
  } catch (...) {
    outputsFilled = std::any_of(outputs, outputs + std::min(outputCount, 16),
                                [](const qvArray* output) { return output != nullptr; });
    throw;
  }
}

/// While it lives, an array is of a class that the module cannot know.
class Disguise {
 public:
  Disguise(std::vector<Array>& arguments, std::size_t which) {
    if (which >= arguments.size()) return;
    array_ = const_cast<qvArray*>(arguments[which].handle());
    classId_ = std::exchange(array_->classId, qvSTRUCT_CLASS);
  }
  ~Disguise() {
    if (array_ != nullptr) array_->classId = classId_;
  }
  Disguise(const Disguise&) = delete;
  Disguise& operator=(const Disguise&) = delete;

 private:
  qvArray* array_ = nullptr;
  qvClassID classId_ = qvUNKNOWN_CLASS;
};

class Sequence {
 public:
  explicit Sequence(std::span<const std::uint8_t> bytes)
      : choices_(bytes), module_(watchedEntryPoint) {
    module_.setExtended(isExtended());
  }

  void run();

 private:
  const Command& nextCommand(std::size_t call);
  void callOne(std::size_t number);
  void perform(const Command& command, CallInput& input);
  void succeeded(const Command& command, const CallInput& input, const std::vector<Array>& results);
  void failed(const Command& command, const std::string& what);
  void adoptUnreturned(const CallInput& input);
  void checkWarnings(std::string_view command) const;
  void checkValue(std::string_view command, const CallInput& input,
                  const std::vector<Array>& results);
  Variable described(const CallInput& input);
  void finish();

  Choices choices_;
  ambrix::Module module_;
  World world_;
};

void Sequence::run() {
  ambrix::setByteLimit(kByteLimit);
  beginSequence(choices_);
  for (std::size_t i = 0; i < kMostCalls && !choices_.usedUp(); ++i)
    callOne(i);
  finish();
}

const Command& Sequence::nextCommand(std::size_t call) {
  if (call < std::size(kBeginnings)) return commands()[placeOf(kBeginnings[call])];
  if (isExtended() && choices_.oneIn(12)) return choices_.pick(extendedCommands());
  if (choices_.oneIn(3) || world_.files().empty())
    return commands()[placeOf(choices_.pick(kFrequent))];
  return choices_.pick(commands());
}

void Sequence::callOne(std::size_t number) {
  const Command& command = nextCommand(number);
  CallInput input;
  input.name = Array::fromNarrow(command.name);
  input.arguments = ArgumentMaker(choices_, world_).argumentsOf(command);
  if (number >= std::size(kBeginnings)) spoil(choices_, world_, input);
  confine(command.name.c_str(), input.arguments);
  beforeCall(choices_);
  callLog().note(shown(input));
  ++callLog().calls;
  perform(command, input);
  ambrix::failAllocation(0);
  requireOpen(world_);
}

void Sequence::perform(const Command& command, CallInput& input) {
  const ambrix::LiveCounts before = ambrix::liveCounts();
  std::vector<Array> results;
  try {
    const Disguise disguise(input.arguments, input.disguised);
    const std::vector<ArrayView> views(input.arguments.begin(), input.arguments.end());
    ambrix::failAllocation(input.failingAllocation);
    results = module_.call(input.name, views, input.outputs);
  } catch (const ambrix::Error& error) {
    ++callLog().errors[requireKnown(error.id())];
    failed(command, error.what());
    if (error.identifier() == "TOLVEX:host:outOfMemory") adoptUnreturned(input);
    return requireNothingLeft(before, {});
  } catch (const std::exception& error) {
    const bool notText =
        error.what() == std::string_view("basic_string::_M_construct null not valid");
    if (!notText) violation(std::string("an exception: ") + error.what());
    ++callLog().errors[placeOfNotText()];
    failed(command, error.what());
    return requireNothingLeft(before, {});
  }
  requireNothingLeft(before, results);
  transcribe(command.name, results, module_.lastWarnings());
  succeeded(command, input, results);
}

void Sequence::failed(const Command& command, const std::string& what) {
  transcribe(command.name, what, module_.lastWarnings());
  callLog().note("    " + what);
  if (outputsFilled) violation("a call that failed has filled an output");
}

/// A file is open even if its identifier was not wanted, or if there was no memory to tell it.
void Sequence::adoptUnreturned(const CallInput& input) {
  for (const TOLVEX::ambrix::CdfId file : TOLVEX::ambrix::openFileRegistry().files()) {
    const auto id = static_cast<std::uint64_t>(file);
    const bool opens = input.arguments.size() == 1;
    if (opens && world_.find(id) == nullptr) world_.opened(id, "");
  }
}

void Sequence::succeeded(const Command& command, const CallInput& input,
                         const std::vector<Array>& results) {
  const std::string_view name = command.name;
  if (input.name.utf8() != name) violation("a command of another name succeeds");
  ++callLog().succeeded[placeOf(name)];
  if (module_.leaks() != ambrix::LiveCounts{}) violation("something was left behind");
  requireSane(command, results, input.outputs);
  checkWarnings(name);
  checkValue(name, input, results);
  input.apply(name, results, world_);
  if (results.empty()) adoptUnreturned(input);
}

/// What the library says of the variable that a call was about.
Variable Sequence::described(const CallInput& input) {
  if (const auto scripted = scriptedVariable()) return *scripted;
  ambrix::failAllocation(0);
  const auto told = module_.call("inquireVar", {input.arguments[0], input.arguments[1]});
  Variable variable{
      datatypeOfName(told[1].utf8()), static_cast<long>(told[2].data<double>()[0]), {}};
  for (const double size : told[3].data<double>())
    variable.sizes.push_back(static_cast<long>(size));
  return variable;
}

void Sequence::checkValue(std::string_view command, const CallInput& input,
                          const std::vector<Array>& results) {
  constexpr std::string_view kReaders[] = {"getVarData", "getVarRecordData", "hyperGetVarData",
                                           "getVarPadValue"};
  const bool reads = std::ranges::find(kReaders, command) != std::end(kReaders);
  if (!reads || results.empty()) return;
  requireFitting(command, input.arguments, results[0], described(input));
}

void Sequence::checkWarnings(std::string_view command) const {
  for (const ambrix::MessageId& warning : module_.lastWarnings()) {
    requireKnown(warning);
    const bool expected =
        command == "getVarCompression" && warning.identifier == "invalidCompressionParameter";
    if (!expected) violation("a warning: " + warning.fullIdentifier());
  }
}

void Sequence::finish() {
  auto& registry = TOLVEX::ambrix::openFileRegistry();
  const std::size_t expected = registry.size() == 0 ? 0 : 1;
  callLog().note("unload");
  module_.unload();
  const auto& warnings = module_.lastWarnings();
  const bool told = warnings.size() == expected &&
                    (warnings.empty() || warnings[0].identifier == "closingFileHandle");
  for (const ambrix::MessageId& warning : warnings)
    ++callLog().errors[requireKnown(warning)];
  if (!told) violation(std::to_string(warnings.size()) + " warnings at unload");
  requireOpen(world_);
  while (registry.size() > 0)  // the module is part of the program and stays loaded
    registry.erase(*registry.files().begin());
  if (ambrix::liveCounts() != ambrix::LiveCounts{}) violation("something outlives the module");
  endSequence();
}

}  // namespace

void runSequence(std::span<const std::uint8_t> bytes) {
  Sequence(bytes).run();
}

}  // namespace ambrix_fuzz
