// The cases leave no command out.
#include "tests/scripted/commands/command_cases.h"

#include "gateway/entry/command_table.h"

namespace ambrix_test {
namespace {

TEST(CommandCasesTest, ThereIsOneForEachCommandInTableOrder) {
  const std::vector<CommandCase> cases = commandCases();
  const auto table = TOLVEX::ambrix::commandTable();
  ASSERT_EQ(cases.size(), table.size());
  for (std::size_t i = 0; i < cases.size(); ++i)
    EXPECT_EQ(cases[i].command, table[i].name);
}

}  // namespace
}  // namespace ambrix_test
