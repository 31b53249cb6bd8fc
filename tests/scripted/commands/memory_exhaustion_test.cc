// Memory that runs out at each point of each command: that of the host, and the module's own.
#include <functional>
#include <new>

#include "gateway/open_file_registry.h"
#include "tests/scripted/commands/command_test.h"
#include "tests/support/failing_new.h"
#include "tests/support/raised_errors.h"

namespace ambrix_test {
namespace {

using testing::IsEmpty;

const std::string kOutOfMemory = "TOLVEX:host:outOfMemory()";
constexpr std::uint64_t kMoreThanAnyCommandTakes = 2000;

class MemoryExhaustionTest : public CommandTest {
 protected:
  MemoryExhaustionTest() {
    fake.moveExactly(0);
    usual = outcome([](std::uint64_t) {}, 0);
  }
  ~MemoryExhaustionTest() override {
    ::ambrix::failAllocation(0);
    failNew(0);
  }

  /// What the command does while the n-th allocation fails: its results, or its error.
  std::string outcome(const std::function<void(std::uint64_t)>& fail, std::uint64_t n);
  /// Lets each allocation fail, the first one first, until the command needs no more of them; gives
  /// the number of failures.
  std::uint64_t failEach(const std::function<void(std::uint64_t)>& fail);

  std::string usual;  // its outcome when nothing fails
};

std::string MemoryExhaustionTest::outcome(const std::function<void(std::uint64_t)>& fail,
                                          std::uint64_t n) {
  call("open", {"any.cdf"});  // again, in case that the command closes it
  fake.forgetCalls();
  const Arguments given = arguments();
  const std::vector<ArrayView> views = viewsOf(given);
  std::vector<Array> results;
  std::string text = "done";
  try {
    fail(n);
    results = module.call(command(), views);
    fail(0);
  } catch (const ::ambrix::Error& error) {
    fail(0);
    text = messageText(error.id());
  }
  for (const std::string& result : shown(results))
    text += "; " + result;
  return text;
}

std::uint64_t MemoryExhaustionTest::failEach(const std::function<void(std::uint64_t)>& fail) {
  call("open", {"any.cdf"});
  const auto alive = ::ambrix::liveCounts();
  const auto files = openFiles();
  for (std::uint64_t n = 1; n < kMoreThanAnyCommandTakes; ++n) {
    const std::string text = outcome(fail, n);
    EXPECT_EQ(::ambrix::liveCounts(), alive) << "allocation " << n;
    if (text == usual) return n - 1;
    EXPECT_EQ(text, kOutOfMemory) << "allocation " << n;
    EXPECT_EQ(openFiles(), files) << "allocation " << n;
  }
  ADD_FAILURE() << "the command never succeeds";
  return 0;
}

TEST_P(MemoryExhaustionTest, OfTheHostIsAnErrorThatLeavesNothingBehind) {
  EXPECT_GE(failEach(::ambrix::failAllocation), 1U);
}

TEST_P(MemoryExhaustionTest, OfTheModuleIsTheSameErrorAndLeavesNothingBehind) {
  EXPECT_GE(failEach(failNew), 1U);
}

// What fails then is the report of the failure, too.
TEST_P(MemoryExhaustionTest, WhileAFailureIsReportedIsAnErrorLikewise) {
  if (reported().empty()) return;
  const auto alive = ::ambrix::liveCounts();
  const std::size_t first = firstReported(GetParam());
  const std::string failure = reportOf(reported()[first], -2013);
  std::string text = kOutOfMemory;
  for (std::uint64_t n = 1; text == kOutOfMemory; ++n) {
    const auto failBoth = [this, first](std::uint64_t at) {
      if (at > 0) fake.failCall(first + 1, -2013);
      failNew(at);
    };
    text = outcome(failBoth, n);
    EXPECT_EQ(::ambrix::liveCounts(), alive) << "allocation " << n;
    fake.failCall(0, 0);
  }
  EXPECT_EQ(text, failure);
}

INSTANTIATE_TEST_SUITE_P(Commands, MemoryExhaustionTest, testing::ValuesIn(commands()), nameOf);

TEST(ErrorsAndMemoryTest, AnErrorThatCannotBeMadeLeavesNothingBehind) {
  const std::string text(100, 't');  // too long to fit into a string itself
  for (const ErrorMaker& make : errorMakers()) {
    const std::string usual = messageText(make(text, text));
    std::uint64_t n = 0;
    for (bool made = false; !made;) {
      failNew(++n);
      try {
        const TOLVEX::ambrix::MessageId error = make(text, text);
        failNew(0);
        made = true;
        EXPECT_EQ(messageText(error), usual);
      } catch (const std::bad_alloc&) {
        EXPECT_FALSE(newFailurePending()) << usual;
      }
    }
    EXPECT_GT(n, 1U) << usual;
  }
}

using FilesAndMemoryTest = ScriptedTest;

// Nobody could close a file that the library has opened and whose identifier is lost.
TEST_F(FilesAndMemoryTest, NoFileIsOpenedUnlessItsIdentifierCanBeReturned) {
  for (const char* command : {"create", "open"}) {
    const Array name = Array::fromNarrow("new.cdf");
    for (std::uint64_t n = 1; n <= 4; ++n) {
      fake.forgetCalls();
      ::ambrix::failAllocation(n);
      EXPECT_THROW(module.call(command, {name}), ::ambrix::Error) << n;
      EXPECT_THAT(fake.calls(), IsEmpty()) << command << ' ' << n;
    }
    EXPECT_FALSE(::ambrix::failurePending());
  }
}

TEST_F(FilesAndMemoryTest, NoFileIsOpenedUnlessItsIdentifierCanBeRegistered) {
  for (const char* command : {"create", "open"}) {
    const Array name = Array::fromNarrow("new.cdf");
    for (std::uint64_t n = 1; n <= 4; ++n) {  // each of the registry's lists
      TOLVEX::ambrix::openFileRegistry().clear();
      fake.forgetCalls();
      failNew(n);
      EXPECT_THROW(module.call(command, {name}), ::ambrix::Error) << n;
      EXPECT_THAT(fake.calls(), IsEmpty()) << command << ' ' << n;
    }
    EXPECT_FALSE(newFailurePending());
  }
}

TEST_F(FilesAndMemoryTest, RegisteringAndMarkingTakeNoMemoryOnceThereIsRoom) {
  using TOLVEX::ambrix::CdfId;
  TOLVEX::ambrix::OpenFileRegistry registry;
  for (std::uint64_t id = 1; id <= 100; ++id) {
    registry.reserve();
    failNew(1);
    registry.insert(CdfId{id});
    registry.markFreed(CdfId{id});
    registry.markWritten(CdfId{id});
    EXPECT_TRUE(newFailurePending()) << id;
    failNew(0);
  }
  EXPECT_EQ(registry.size(), 100U);
  registry.clear();
  bool hasKeptMemory = true;
  failNew(1);
  try {
    registry.reserve();
  } catch (const std::bad_alloc&) {
    hasKeptMemory = false;
  }
  failNew(0);
  EXPECT_FALSE(hasKeptMemory);
}

}  // namespace
}  // namespace ambrix_test
