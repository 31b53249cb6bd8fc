// Calls of a module: inputs, results, errors, warnings, and what is left behind.
#include <ambrix/embedded.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <new>
#include <stdexcept>
#include <string>

#include "host/qvh.h"

namespace {

using ambrix::Array;
using ambrix::ArrayView;
using ambrix::MessageId;
using ambrix::Module;
using testing::ElementsAre;
using testing::SizeIs;

class EmbeddedModuleTest : public testing::Test {
 protected:
  void TearDown() override { EXPECT_EQ(ambrix::liveCounts(), ambrix::LiveCounts{}); }
};

double number(ArrayView array) {
  return array.data<double>()[0];
}

/// Gives the two counts it was called with, then the sizes of the inputs' data.
void tellingModule(int outputCount, qvArray* outputs[], int inputCount, const qvArray* inputs[]) {
  outputs[0] = qvCreateDoubleScalar(outputCount);
  outputs[1] = qvCreateDoubleScalar(inputCount);
  outputs[2] =
      qvCreateNumericMatrix(static_cast<std::size_t>(inputCount), 1, qvDOUBLE_CLASS, qvREAL);
  auto* const counts = static_cast<double*>(qvGetData(outputs[2]));
  for (int i = 0; i < inputCount; ++i) {
    counts[i] = static_cast<double>(qvGetNumberOfElements(inputs[i]));
  }
}

TEST_F(EmbeddedModuleTest, HandsOverCommandAndArguments) {
  Module module(tellingModule);
  const Array pair = Array::row({1.0, 2.0});
  std::vector<Array> results = module.call("name", {pair, Array::fromUtf8("abc"), pair});
  EXPECT_EQ(number(results.at(1)), 4);
  EXPECT_THAT(results.at(2).data<double>(), ElementsAre(4, 2, 3, 2));
  EXPECT_THAT(module.call("name", {}).at(2).data<double>(), ElementsAre(4));
  EXPECT_THAT(module.call(pair).at(2).data<double>(), ElementsAre(2));
  EXPECT_THAT(module.call(pair, results).at(2).data<double>(), ElementsAre(2, 1, 1, 4));
  const std::vector<ArrayView> views(40, pair);
  EXPECT_THAT(module.call("", views).at(2).data<double>(), SizeIs(41));
}

TEST_F(EmbeddedModuleTest, GivesTheModuleRoomWhateverIsWanted) {
  Module module(tellingModule);
  EXPECT_THAT(module.call("c", {}, 0), SizeIs(0));
  EXPECT_THAT(module.call("c", {}, 2), SizeIs(2));
  EXPECT_EQ(number(module.call("c", {}, 2)[0]), 2);
  EXPECT_THAT(module.call("c", {}, 1000), SizeIs(3));
  EXPECT_GE(number(module.call("c")[0]), 8);
  EXPECT_EQ(module.leaks(), ambrix::LiveCounts{});
}

TEST_F(EmbeddedModuleTest, InputsMustBeArrays) {
  Module module(tellingModule);
  EXPECT_THROW(module.call(Array()), std::invalid_argument);
  EXPECT_THROW(module.call("c", {ArrayView()}), std::invalid_argument);
  EXPECT_THROW(Module(nullptr), std::invalid_argument);
}

TEST_F(EmbeddedModuleTest, AModuleThatFillsNothingGivesNothing) {
  Module module([](int, qvArray*[], int, const qvArray*[]) {});
  EXPECT_THAT(module.call("c"), SizeIs(0));
}

TEST_F(EmbeddedModuleTest, ResultsEndAtTheFirstEmptySlot) {
  Module module([](int, qvArray* outputs[], int, const qvArray*[]) {
    outputs[0] = qvCreateDoubleScalar(1);
    outputs[2] = qvCreateDoubleScalar(3);
  });
  EXPECT_THAT(module.call("c"), SizeIs(1));
  EXPECT_EQ(module.leaks(), (ambrix::LiveCounts{1, 0}));
}

TEST_F(EmbeddedModuleTest, ForeignArraysAreNoResults) {
  Module returnsInput([](int, qvArray* outputs[], int, const qvArray* inputs[]) {
    outputs[0] = const_cast<qvArray*>(inputs[0]);
  });
  const Array command = Array::scalar(1.0);
  EXPECT_THROW(returnsInput.call(command), std::logic_error);
  EXPECT_EQ(number(command), 1.0);
  Module returnsTwice([](int, qvArray* outputs[], int, const qvArray*[]) {
    outputs[0] = outputs[1] = qvCreateDoubleScalar(1);
  });
  EXPECT_THROW(returnsTwice.call(command), std::logic_error);
}

TEST_F(EmbeddedModuleTest, ErrorsReachTheCallerAndLeaveNothing) {
  Module module([](int, qvArray* outputs[], int, const qvArray*[]) {
    outputs[0] = qvCreateString("half done");
    qvSetCell(outputs[1] = qvCreateCellMatrix(1, 1), 0, qvCreateDoubleScalar(1));
    (void)qvMalloc(10);
    qvErrMsgId({"TEST:component", "name", {5, "five", u"V"}});
  });
  try {
    module.call("c");
    FAIL() << "the error was lost";
  } catch (const ambrix::Error& error) {
    EXPECT_EQ(error.identifier(), "TEST:component:name");
    EXPECT_THAT(error.values(), ElementsAre(ambrix::MessageArg(5), ambrix::MessageArg("five"),
                                            ambrix::MessageArg(u"V")));
    EXPECT_EQ(ambrix::liveCounts(), ambrix::LiveCounts{});
  }
  EXPECT_EQ(module.leaks(), ambrix::LiveCounts{});
}

TEST_F(EmbeddedModuleTest, WhatASuccessfulCallLeavesIsReclaimedAndCounted) {
  Module module([](int, qvArray* outputs[], int, const qvArray*[]) {
    outputs[0] = qvCreateDoubleScalar(1);
    (void)qvCreateString("forgotten");
    (void)qvMalloc(1);
    (void)qvMalloc(2);
  });
  module.call("c");
  EXPECT_EQ(ambrix::liveCounts(), ambrix::LiveCounts{});
  EXPECT_EQ(module.leaks(), (ambrix::LiveCounts{1, 2}));
  module.call("c");
  EXPECT_EQ(module.leaks(), (ambrix::LiveCounts{2, 4}));
}

TEST_F(EmbeddedModuleTest, MemoryExhaustionInTheModuleIsAnErrorOfTheHost) {
  Module module([](int, qvArray*[], int, const qvArray*[]) {
    (void)qvMalloc(1);
    throw std::bad_alloc();
  });
  try {
    module.call("c");
    FAIL() << "the error was lost";
  } catch (const ambrix::Error& error) {
    EXPECT_EQ(error.identifier(), "TOLVEX:host:outOfMemory");
  }
}

TEST_F(EmbeddedModuleTest, OtherExceptionsPassUnchanged) {
  Module module([](int, qvArray*[], int, const qvArray*[]) {
    (void)qvCreateDoubleScalar(1);
    throw std::logic_error("the very text");
  });
  try {
    module.call("c");
    FAIL() << "the exception was lost";
  } catch (const std::logic_error& error) {
    EXPECT_STREQ(error.what(), "the very text");
  }
  Module throwsNumber([](int, qvArray*[], int, const qvArray*[]) { throw 42; });
  EXPECT_THROW(throwsNumber.call("c"), int);
}

/// Warns once for each input, then fails when there is more than one.
void warningModule(int, qvArray* outputs[], int inputCount, const qvArray*[]) {
  for (int i = 0; i < inputCount; ++i)
    qvWarningMsgId({"TEST", "warning", {i}});
  outputs[0] = qvCreateDoubleScalar(1);
  if (inputCount > 1) qvErrMsgId({"TEST", "error"});
}

TEST_F(EmbeddedModuleTest, WarningsOfTheLastCallAreKept) {
  Module module(warningModule);
  const Array argument = Array::scalar(1.0);
  EXPECT_THAT(module.lastWarnings(), SizeIs(0));
  EXPECT_THROW(module.call("c", {argument}), ambrix::Error);
  ASSERT_THAT(module.lastWarnings(), SizeIs(2));
  EXPECT_EQ(module.lastWarnings()[1].fullIdentifier(), "TEST:warning");
  EXPECT_THAT(module.lastWarnings()[1].values, ElementsAre(ambrix::MessageArg(1)));
  EXPECT_THAT(module.call("c"), SizeIs(1));
  EXPECT_THAT(module.lastWarnings(), SizeIs(1));
}

TEST_F(EmbeddedModuleTest, AHandlerTakesWarningsAsTheyCome) {
  Module module(warningModule);
  std::vector<std::string> taken;
  module.setWarningHandler([&](const MessageId& id) { taken.push_back(id.fullIdentifier()); });
  module.call("c");
  EXPECT_THAT(taken, ElementsAre("TEST:warning"));
  EXPECT_THAT(module.lastWarnings(), SizeIs(0));
}

TEST_F(EmbeddedModuleTest, AHandlerThatThrowsEndsTheCall) {
  Module module(warningModule);
  module.setWarningHandler([](const MessageId&) { throw std::runtime_error("strict"); });
  EXPECT_THROW(module.call("c"), std::runtime_error);
  module.setWarningHandler(nullptr);
  EXPECT_THAT(module.call("c"), SizeIs(1));
}

TEST_F(EmbeddedModuleTest, AHandlerMayCallModules) {
  Module inner(tellingModule);
  Module module([](int, qvArray* outputs[], int, const qvArray*[]) {
    outputs[0] = qvCreateDoubleScalar(7);
    qvWarningMsgId({"TEST", "warning"});
    outputs[1] = qvCreateDoubleScalar(8);
  });
  std::vector<Array> innerResults;
  module.setWarningHandler([&](const MessageId&) { innerResults = inner.call("c"); });
  const std::vector<Array> results = module.call("c");
  ASSERT_THAT(results, SizeIs(2));
  EXPECT_EQ(number(results[1]), 8);
  EXPECT_THAT(innerResults, SizeIs(3));
  EXPECT_EQ(module.leaks(), ambrix::LiveCounts{});
}

TEST_F(EmbeddedModuleTest, ArraysOfTheHandlerAreNotTheModules) {
  Module module(warningModule);
  Array kept;
  module.setWarningHandler([&](const MessageId&) { kept = Array::scalar(3.0); });
  module.call("c");
  EXPECT_EQ(number(kept), 3.0);
}

TEST_F(EmbeddedModuleTest, CallsOutliveTheirModule) {
  std::vector<Array> results;
  {
    Module module(tellingModule);
    results = module.call("c");
  }
  EXPECT_EQ(number(results.at(1)), 1);
}

}  // namespace
