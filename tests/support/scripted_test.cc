#include "tests/support/scripted_test.h"

#include <algorithm>
#include <exception>

#include "gateway/library_faults.h"
#include "gateway/open_file_registry.h"
#include "host/qvh.h"

namespace ambrix_test {
namespace {

bool outputsFilled = false;

/// The module's entry point, with a look at the outputs of a call that fails.
void watchedEntryPoint(int outputCount, qvArray* outputs[], int inputCount,
                       const qvArray* inputs[]) {
  try {
    qvhFunction(outputCount, outputs, inputCount, inputs);
  } catch (...) {
    outputsFilled = std::any_of(outputs, outputs + outputCount,
                                [](const qvArray* output) { return output != nullptr; });
    throw;
  }
}

}  // namespace

ScriptedTest::ScriptedTest() : module(watchedEntryPoint) {
  TOLVEX::ambrix::libraryFaults() = {};
  fake = FakeCdflib();
  fake.answer("handle", {kHandle});
  call("open", {"any.cdf"});
  fake.forgetCalls();
}

ScriptedTest::~ScriptedTest() {
  EXPECT_EQ(module.leaks(), ::ambrix::LiveCounts{});
  auto& registry = TOLVEX::ambrix::openFileRegistry();
  while (registry.size() > 0)
    registry.erase(*registry.files().begin());
}

std::vector<Array> ScriptedTest::call(const std::string& command, const Arguments& arguments) {
  return module.call(command, viewsOf(arguments));
}

Array ScriptedTest::result(const std::string& command, const Arguments& arguments) {
  std::vector<Array> results = call(command, arguments);
  return results.empty() ? Array() : std::move(results.front());
}

std::string ScriptedTest::errorOf(const std::string& command, const Arguments& arguments) {
  const auto before = ::ambrix::liveCounts();
  const auto files = openFiles();
  outputsFilled = false;
  std::string message = "no error";
  try {
    call(command, arguments);
  } catch (const ::ambrix::Error& error) {
    message = messageText(error.id());
  } catch (const std::exception& error) {
    message = error.what();
  }
  EXPECT_FALSE(outputsFilled) << command;
  EXPECT_EQ(::ambrix::liveCounts(), before) << command;
  EXPECT_TRUE(message == "no error" || openFiles() == files) << command;
  return message;
}

std::vector<std::string> ScriptedTest::calls() {
  std::vector<std::string> calls = fake.calls();
  fake.forgetCalls();
  return calls;
}

std::vector<std::string> ScriptedTest::warnings() {
  std::vector<std::string> texts;
  for (const auto& warning : module.lastWarnings())
    texts.push_back(messageText(warning));
  return texts;
}

void ScriptedTest::describe(const Variable& variable) {
  Numbers variances = variable.variances;
  if (variances.empty()) variances.assign(variable.sizes.size(), -1);
  fake.answerText("zVAR_NAME_", variable.name);
  fake.answer("zVAR_DATATYPE_", {variable.datatype});
  fake.answer("zVAR_NUMELEMS_", {variable.elements});
  fake.answer("zVAR_NUMDIMS_", {static_cast<long>(variable.sizes.size())});
  fake.answer("zVAR_DIMSIZES_", variable.sizes);
  fake.answer("zVAR_RECVARY_", {variable.recordVariance});
  fake.answer("zVAR_DIMVARYS_", variances);
  fake.answer("CDF_MAJORITY_", {variable.majority});
}

std::set<TOLVEX::ambrix::CdfId> openFiles() {
  const auto& files = TOLVEX::ambrix::openFileRegistry().files();
  return {files.begin(), files.end()};
}

std::vector<std::string> shown(const std::vector<Array>& arrays) {
  std::vector<std::string> texts;
  for (const Array& array : arrays)
    texts.push_back(shown(array));
  return texts;
}

}  // namespace ambrix_test
