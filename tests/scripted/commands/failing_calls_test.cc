// Every call of the library fails in turn, in every command.
#include "tests/scripted/commands/command_test.h"

namespace ambrix_test {
namespace {

using testing::IsEmpty;
using testing::SizeIs;

constexpr long kError = -2013;
constexpr long kWarning = -1007;
constexpr long kBadCdfId = -2002;

class FailingCallsTest : public CommandTest {
 protected:
  /// Makes the file usable again after a failed "close".
  void reopen() {
    call("open", {"any.cdf"});
    fake.forgetCalls();
  }
};

TEST_P(FailingCallsTest, EachFailureIsReportedUnderItsRoutineAndLeavesNothing) {
  for (const long status : {kError, kWarning}) {
    for (std::size_t n = 1; n <= reported().size(); ++n) {
      reopen();
      if (reported()[n - 1] == "?") continue;
      fake.failCall(n, status);
      EXPECT_EQ(errorOf(command(), arguments()), reportOf(reported()[n - 1], status))
          << "call " << n;
      EXPECT_THAT(calls(), SizeIs(n)) << "the command went on after call " << n;
    }
  }
}

TEST_P(FailingCallsTest, WithoutAnAnswerToAGuardTheLibraryItselfAnswers) {
  for (std::size_t n = 1; n <= reported().size(); ++n) {
    if (reported()[n - 1] != "?") continue;
    reopen();
    fake.failCall(n, kError);
    EXPECT_EQ(errorOf(command(), arguments()), "no error");
    EXPECT_THAT(calls(), SizeIs(reported().size()));
  }
}

TEST_P(FailingCallsTest, ItMakesThoseCallsAndSucceedsWithItsResults) {
  EXPECT_THAT(call(command(), arguments()), SizeIs(GetParam().results.size()));
  EXPECT_TRUE(reported().empty() || fake.calls().size() == reported().size());
  EXPECT_THAT(fake.statusCalls(), IsEmpty());
}

TEST_P(FailingCallsTest, PositiveStatusesAreSuccess) {
  if (reported().empty()) return;
  fake.endWith("", 1003);
  EXPECT_NO_THROW(call(command(), arguments()));
}

TEST_P(FailingCallsTest, AFileThatTheLibraryHasFreedIsRefusedWithoutAskingIt) {
  if (!GetParam().takesFile()) return;
  fake.failCall(1, -2055);
  errorOf("close", {file()});
  fake.forgetCalls();
  EXPECT_EQ(errorOf(command(), arguments()),
            libraryFailure(reported()[firstReported(GetParam())], kBadCdfId));
  EXPECT_THAT(calls(), IsEmpty());
}

INSTANTIATE_TEST_SUITE_P(Commands, FailingCallsTest, testing::ValuesIn(commands()), nameOf);

}  // namespace
}  // namespace ambrix_test
