// Memory that runs out, and results that nobody asks for.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

/// Begins with a file that has something of everything.
class MemoryTest : public ModuleTest {
 protected:
  MemoryTest() {
    createVar(file, {.sizes = {2}, .name = "numbers"});
    createVar(file, {.datatype = 51, .sizes = {2}, .elements = 3, .name = "texts"});
    results("putVarRecordData", {file, 0, 0, row<std::int32_t>({1, 2})});
    results("putVarRecordData", {file, 1, 0, "abcdef"});
    results("createAttr", {file, "a", 1});
    results("putAttrgEntry", {file, 0, 0, 51, "text"});
  }

  std::vector<std::pair<const char*, Arguments>> commands() const {
    return {{"getConstantNames", {}},
            {"getConstantValue", {"VARY"}},
            {"getLibraryVersion", {}},
            {"inquire", {file}},
            {"getName", {file}},
            {"getMajority", {file}},
            {"getCompression", {file}},
            {"getVarCompression", {file, 0}},
            {"inquireVar", {file, 0}},
            {"getVarNum", {file, "texts"}},
            {"inquireAttr", {file, 0}},
            {"getAttrgEntry", {file, 0, 0}},
            {"putAttrgEntry", {file, 0, 0, 51, "text"}},
            {"getVarData", {file, 1, 0, 0}},
            {"getVarRecordData", {file, 0, 0}},
            {"getVarRecordData", {file, 1, 0}},
            {"hyperGetVarData", {file, 1, 0, 1, 1, 0, 2, 1}},
            {"putVarRecordData", {file, 1, 0, "abcdef"}},
            {"getVarPadValue", {file, 1}},
            {"setVarPadValue", {file, 1, "pad"}},
            {"computeEpoch", {{2000, 1, 1, 0, 0, 0, 0}}},
            {"epoch16Breakdown", {{1, 2}}}};
  }

  Given file = create();
};

// The fixture tests after each call that nothing is left alive.
TEST_F(MemoryTest, ARefusedAllocationEndsACommandCleanly) {
  for (const auto& [command, arguments] : commands()) {
    const std::string succeeds = does(command, arguments);
    std::string text;
    for (std::uint64_t n = 1; text != succeeds && n < 300; ++n) {
      ::ambrix::failAllocation(n);
      text = does(command, arguments);
      ::ambrix::failAllocation(0);
      if (text == succeeds) break;
      EXPECT_THAT(text, testing::StartsWith("TOLVEX:host:outOfMemory")) << command << ' ' << n;
    }
    EXPECT_EQ(text, succeeds) << command;
  }
}

TEST_F(MemoryTest, ResultsThatNobodyAsksForAreReclaimed) {
  const auto arrays = ::ambrix::liveCounts().arrays;
  EXPECT_TRUE(module.call("inquire", {file.view()}, 0).empty());
  EXPECT_EQ(::ambrix::liveCounts().arrays, arrays);
  EXPECT_EQ(module.call("inquire", {file.view()}, 2).size(), 2U);
  EXPECT_EQ(::ambrix::liveCounts().arrays, arrays);
}

}  // namespace
}  // namespace ambrix_test
