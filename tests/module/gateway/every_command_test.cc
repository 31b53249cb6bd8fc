// What all commands on files have in common, with files of the library.
#include <cmath>

#include "tests/module/support/module_test.h"
#include "tests/support/command_signatures.h"
#include "tests/support/examples.h"

namespace ambrix_test {
namespace {

using EveryCommandTest = ModuleTest;

Arguments examplesOf(const Command& command, const Given& file) {
  Arguments arguments = examplesOf(command);
  arguments[0] = file;
  return arguments;
}

/// Commands whose first arguments are a file and a number of this kind.
std::vector<Command> commandsOn(const char* kind) {
  std::vector<Command> found;
  for (const Command& command : commands()) {
    if (command.maximum() > 1 && command.arguments[1].kind == kind) found.push_back(command);
  }
  return found;
}

/// That of its first call that is about more than the file.
std::string routineOf(const Command& command) {
  const std::string& first = command.reported[0];
  return first == "?" || first == "CDFgetFormat" ? command.reported[1] : first;
}

TEST_F(EveryCommandTest, RefusesAFileThatWasNeverOpenedOrIsClosed) {
  const Given closed = create();
  results("close", {closed});
  for (const Command& command : commands()) {
    if (!command.takesFile()) continue;
    for (const Given& file : {closed, Given(Array::scalar(std::uint64_t{5}))})
      EXPECT_EQ(does(command.name, examplesOf(command, file)), kInvalidFileId) << command;
  }
}

TEST_F(EveryCommandTest, FailsUnderItsRoutineWhenTheVariableIsMissing) {
  const Given file = createMultiFile();
  createVar(file, {});
  const std::pair<double, const char*> numbers[] = {
      {1, kNoSuchVar}, {4294967296.0, kNoSuchVar}, {-1, kBadVarNum}, {-4294967296.0, kBadVarNum}};
  for (const Command& command : commandsOn("variable")) {
    Arguments arguments = examplesOf(command, file);
    for (const auto& [number, text] : numbers) {
      arguments[1] = number;
      EXPECT_EQ(does(command.name, arguments), refused(routineOf(command).c_str(), text))
          << command << ' ' << number;
    }
  }
}

TEST_F(EveryCommandTest, FailsUnderItsRoutineWhenTheAttributeIsMissing) {
  const Given file = create();
  results("createAttr", {file, "only", 1});
  const std::pair<double, const char*> numbers[] = {
      {1, kNoSuchAttr},  {4294967296.0, kNoSuchAttr}, {1e18, kNoSuchAttr},
      {-1, kBadAttrNum}, {-1e18, kBadAttrNum},        {NAN, kBadAttrNum}};
  for (const Command& command : commandsOn("attribute")) {
    Arguments arguments = examplesOf(command, file);
    for (const auto& [number, text] : numbers) {
      arguments[1] = number;
      EXPECT_EQ(does(command.name, arguments), refused(routineOf(command).c_str(), text))
          << command << ' ' << number;
    }
  }
}

}  // namespace
}  // namespace ambrix_test
