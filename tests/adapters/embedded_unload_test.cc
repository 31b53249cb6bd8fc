// The end of a module: its unload handler runs once, and nothing escapes from it.
#include <ambrix/embedded.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <optional>
#include <stdexcept>
#include <utility>

#include "host/qvh.h"

namespace {

using ambrix::MessageId;
using ambrix::Module;
using testing::SizeIs;

int unloadings = 0;
int filesClosed = 0;

/// Registers a handler that warns, then does what must not be missed.
void registeringModule(int, qvArray*[], int, const qvArray*[]) {
  qvhAtExit([] {
    ++unloadings;
    qvWarningMsgId({"TEST", "closing"});
    ++filesClosed;
  });
}

class EmbeddedUnloadTest : public testing::Test {
 protected:
  EmbeddedUnloadTest() { unloadings = filesClosed = 0; }
  void TearDown() override { EXPECT_EQ(ambrix::liveCounts(), ambrix::LiveCounts{}); }
};

TEST_F(EmbeddedUnloadTest, TheHandlerRunsOnceHoweverOftenItIsRegistered) {
  {
    Module module(registeringModule);
    for (int call = 0; call < 5; ++call)
      module.call("c");
    EXPECT_EQ(unloadings, 0);
    module.unload();
    EXPECT_EQ(unloadings, 1);
    EXPECT_FALSE(module.loaded());
    module.unload();
  }
  EXPECT_EQ(unloadings, 1);
}

TEST_F(EmbeddedUnloadTest, DestructionUnloads) {
  { Module(registeringModule).call("c"); }
  EXPECT_EQ(unloadings, 1);
}

TEST_F(EmbeddedUnloadTest, AModuleThatWasNeverCalledHasNoHandler) {
  { const Module module(registeringModule); }
  EXPECT_EQ(unloadings, 0);
}

TEST_F(EmbeddedUnloadTest, WarningsOfUnloadingAreKept) {
  Module module(registeringModule);
  module.call("c");
  module.unload();
  ASSERT_THAT(module.lastWarnings(), SizeIs(1));
  EXPECT_EQ(module.lastWarnings()[0].fullIdentifier(), "TEST:closing");
}

TEST_F(EmbeddedUnloadTest, CallsAfterUnloadingAreRefused) {
  Module module(registeringModule);
  module.unload();
  EXPECT_THROW(module.call("c"), std::logic_error);
}

TEST_F(EmbeddedUnloadTest, AWarningHandlerThatThrowsDoesNotKeepTheModuleFromCleaningUp) {
  {
    Module module(registeringModule);
    module.call("c");
    module.setWarningHandler([](const MessageId&) { throw std::runtime_error("strict"); });
  }
  EXPECT_EQ(filesClosed, 1);
}

TEST_F(EmbeddedUnloadTest, WhatTheUnloadHandlerThrowsIsDroppedAndWhatItLeavesReclaimed) {
  {
    Module module([](int, qvArray*[], int, const qvArray*[]) {
      qvhAtExit([] {
        ++unloadings;
        (void)qvMalloc(5);
        (void)qvCreateString("left");
        qvErrMsgId({"TEST", "error"});
      });
    });
    module.call("c");
    module.unload();
    EXPECT_EQ(ambrix::liveCounts(), ambrix::LiveCounts{});
  }
  EXPECT_EQ(unloadings, 1);
}

TEST_F(EmbeddedUnloadTest, AModuleMovesWithItsHandler) {
  Module first(registeringModule);
  first.call("c");
  Module second = std::move(first);
  EXPECT_FALSE(first.loaded());
  EXPECT_THROW(first.call("c"), std::logic_error);
  EXPECT_THAT(first.lastWarnings(), SizeIs(0));
  EXPECT_EQ(unloadings, 0);
  second = Module(registeringModule);
  EXPECT_EQ(unloadings, 1);
}

TEST_F(EmbeddedUnloadTest, AModuleIsNotUnloadedUnderItsOwnFeet) {
  Module module([](int, qvArray*[], int, const qvArray*[]) { qvWarningMsgId({"TEST", "w"}); });
  module.setWarningHandler([&](const MessageId&) { module.unload(); });
  EXPECT_THROW(module.call("c"), std::logic_error);
  EXPECT_TRUE(module.loaded());
}

TEST_F(EmbeddedUnloadTest, TheLastHandlerRegisteredCounts) {
  {
    Module module([](int, qvArray*[], int, const qvArray*[]) {
      qvhAtExit([] { unloadings += 100; });
      qvhAtExit([] { unloadings += 1; });
    });
    module.call("c");
  }
  EXPECT_EQ(unloadings, 1);
}

}  // namespace
