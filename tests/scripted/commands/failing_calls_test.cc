// Every call of the library fails in turn, in every command.
#include "tests/scripted/commands/command_cases.h"

namespace ambrix_test {
namespace {

using testing::IsEmpty;
using testing::SizeIs;

constexpr long kError = -2013;
constexpr long kWarning = -1007;
constexpr long kBadCdfId = -2002;

class FailingCallsTest : public CommandTest, public testing::WithParamInterface<CommandCase> {
 protected:
  /// Makes the file usable again after a failed "close".
  void reopen() {
    call("open", {"any.cdf"});
    fake.forgetCalls();
  }
  const std::string& command = GetParam().command;
  const Arguments& arguments = GetParam().arguments;
  const std::vector<std::string>& reported = GetParam().reported;
};

TEST_P(FailingCallsTest, EachFailureIsReportedUnderItsRoutineAndLeavesNothing) {
  for (const long status : {kError, kWarning}) {
    for (std::size_t n = 1; n <= reported.size(); ++n) {
      reopen();
      if (reported[n - 1].empty()) continue;
      fake.failCall(n, status);
      EXPECT_EQ(errorOf(command, arguments), reportOf(reported[n - 1], status)) << "call " << n;
      EXPECT_THAT(calls(), SizeIs(n)) << "the command went on after call " << n;
    }
  }
}

TEST_P(FailingCallsTest, WithoutAnAnswerToAGuardTheLibraryItselfAnswers) {
  for (std::size_t n = 1; n <= reported.size(); ++n) {
    if (!reported[n - 1].empty()) continue;
    reopen();
    fake.failCall(n, kError);
    EXPECT_EQ(errorOf(command, arguments), "no error");
    EXPECT_THAT(calls(), SizeIs(reported.size()));
  }
}

TEST_P(FailingCallsTest, ItMakesThoseCallsAndSucceeds) {
  fake.answer("CDFgetValidate", {1});
  EXPECT_NO_THROW(call(command, arguments));
  EXPECT_TRUE(reported.empty() || fake.calls().size() == reported.size());
  EXPECT_THAT(fake.statusCalls(), IsEmpty());
}

TEST_P(FailingCallsTest, PositiveStatusesAreSuccess) {
  if (reported.empty()) return;
  fake.endWith("", 1003);
  EXPECT_NO_THROW(call(command, arguments));
}

TEST_P(FailingCallsTest, AFileIsOneUint64ThatTheModuleHasHandedOut) {
  if (arguments.empty() || arguments[0].view().classId() != ClassId::kUint64) return;
  Arguments wrong = arguments;
  wrong[0] = 7;
  EXPECT_EQ(errorOf(command, wrong), validate("argumentNotUint64Scalar", "CDFID"));
  wrong[0] = row<std::uint64_t>({7, 7});
  EXPECT_EQ(errorOf(command, wrong), validate("argumentNotUint64Scalar", "CDFID"));
  wrong[0] = file(8);
  EXPECT_EQ(errorOf(command, wrong), cdflib("invalidFileId"));
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_P(FailingCallsTest, AFileThatTheLibraryHasFreedIsRefusedWithoutAskingIt) {
  if (arguments.empty() || arguments[0].view().classId() != ClassId::kUint64) return;
  fake.failCall(1, -2055);
  errorOf("close", {file()});
  fake.forgetCalls();
  EXPECT_EQ(errorOf(command, arguments), libraryFailure(firstReport(GetParam()), kBadCdfId));
  EXPECT_THAT(calls(), IsEmpty());
}

INSTANTIATE_TEST_SUITE_P(Commands, FailingCallsTest, testing::ValuesIn(commandCases()),
                         [](const auto& given) { return given.param.command; });

}  // namespace
}  // namespace ambrix_test
