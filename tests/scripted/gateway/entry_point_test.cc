// How a call enters the module and how errors leave it.
#include <limits>

#include "file/file_lifecycle.h"
#include "host/qvh.h"
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using EntryPointTest = ScriptedTest;

TEST_F(EntryPointTest, ACommandThatIsNoTextIsALogicErrorWithTheKnownText) {
  const Given commands[] = {5, {}, row<char16_t>({}), row<bool>({true})};
  const auto failure = [&](const Given& command) {
    try {
      module.call(command.view());
    } catch (const ::ambrix::Error& error) {
      return messageText(error.id());
    } catch (const std::logic_error& error) {
      return std::string(error.what());
    }
    return std::string("no error");
  };
  EXPECT_EQ(failure(commands[0]), "basic_string::_M_construct null not valid");
  EXPECT_EQ(failure(commands[1]), "basic_string::_M_construct null not valid");
  EXPECT_EQ(failure(commands[2]), cdflib("invalidOperation", ""));
  EXPECT_EQ(failure(commands[3]), "basic_string::_M_construct null not valid");
}

TEST_F(EntryPointTest, ACommandEndsAtItsFirstZero) {
  const Array command = Array::fromNarrow(std::string("getConstantNames\0x", 18));
  EXPECT_EQ(module.call(command).size(), 1U);
}

TEST_F(EntryPointTest, ACommandKeepsTheLowBitsOfItsCharacters) {
  const Array command = Array::text(u"\u0167etConstantNames");  // low byte 0x67, "g"
  EXPECT_EQ(module.call(command).size(), 1U);
}

TEST_F(EntryPointTest, OverflowInAnyConversionIsOutOfBounds) {
  const double outside[] = {9223372036854775808.0,
                            -9223372036854775808.0,
                            9.3e18,
                            1e300,
                            std::numeric_limits<double>::infinity(),
                            -std::numeric_limits<double>::infinity()};
  for (const double number : outside) {
    EXPECT_EQ(errorOf("getVarName", {file(), number}), validate("argumentOutOfBounds"));
    EXPECT_EQ(errorOf("getVarData", {file(), 3, 0, {1, number, 2}}),
              validate("argumentOutOfBounds"));
    EXPECT_EQ(errorOf("computeEpoch", {{number, 0, 0, 0, 0, 0, 0}}),
              validate("argumentOutOfBounds"));
    EXPECT_EQ(errorOf("createVar", {file(), "v", 4, 1, {}, number, {}}),
              validate("argumentOutOfBounds"));
  }
}

TEST_F(EntryPointTest, ResultsComeWhateverNumberIsWanted) {
  EXPECT_EQ(module.call("getLibraryVersion", {}, 0).size(), 0U);
  EXPECT_EQ(module.call("getLibraryVersion", {}, 2).size(), 2U);
  EXPECT_EQ(module.call("getLibraryVersion").size(), 3U);
}

TEST_F(EntryPointTest, EveryCallRegistersTheUnloadHandlerBeforeItReadsAnything) {
  ::ambrix::Module fresh(qvhFunction);
  EXPECT_THROW(fresh.call("fly"), ::ambrix::Error);
  fake.forgetCalls();
  fresh.unload();
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | CLOSE_ CDF_"));
}

TEST_F(EntryPointTest, TheHandshakeTellsTheFixedCodes) {
  std::uint32_t release = 1, api = 1;
  qvhfilerequiredapiversion(&release, &api);
  EXPECT_EQ(release, 0x01000000U);
  EXPECT_EQ(api, 0x00010000U);
}

TEST_F(EntryPointTest, MemoryRunningOutLeavesNothing) {
  const Arguments arguments{file(), 3};
  for (std::uint64_t n = 1; n < 20; ++n) {
    ::ambrix::failAllocation(n);
    const std::string error = errorOf("inquireVar", arguments);
    const bool failed = !::ambrix::failurePending();
    ::ambrix::failAllocation(0);
    EXPECT_TRUE(!failed || error != "no error") << n;
  }
}

}  // namespace
}  // namespace ambrix_test
