// The module's commands are those of the tests' own table.
#include "gateway/entry/command_table.h"

#include <map>
#include <set>
#include <string>

#include "tests/support/command_signatures.h"
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using CommandTableTest = ScriptedTest;

TEST_F(CommandTableTest, RowsIdsNamesAndCountsAreAsDocumentedInOrder) {
  const auto table = TOLVEX::ambrix::commandTable();
  ASSERT_EQ(table.size(), commands().size());
  for (std::size_t i = 0; i < table.size(); ++i) {
    const Command& command = commands()[i];
    EXPECT_EQ(table[i].name, command.name);
    EXPECT_EQ(table[i].id, command.id) << command;
    EXPECT_EQ(table[i].minimumArguments, std::int64_t(command.minimum())) << command;
    EXPECT_EQ(table[i].maximumArguments, std::int64_t(command.maximum())) << command;
  }
}

TEST_F(CommandTableTest, IdsRunFromZeroToNinetyTwoWithoutTwo) {
  std::set<int> ids;
  for (const auto& entry : TOLVEX::ambrix::commandTable())
    ids.insert(entry.id);
  EXPECT_EQ(ids.size(), 91U);
  EXPECT_EQ(*ids.begin(), 0);
  EXPECT_EQ(*ids.rbegin(), 92);
  EXPECT_FALSE(ids.contains(47));
  EXPECT_FALSE(ids.contains(81));
}

TEST_F(CommandTableTest, OnlyTheTwoEntryWritersShareAHandler) {
  std::map<TOLVEX::ambrix::Handler, std::set<std::string>> commands;
  for (const auto& entry : TOLVEX::ambrix::commandTable())
    commands[entry.handler].emplace(entry.name);
  EXPECT_EQ(commands.size(), 90U);
  std::set<std::string> shared;
  for (const auto& [handler, names] : commands) {
    if (names.size() > 1) shared.insert(names.begin(), names.end());
  }
  EXPECT_THAT(shared, testing::ElementsAre("putAttrEntry", "putAttrgEntry"));
}

TEST_F(CommandTableTest, TooFewAndTooManyArgumentsAreRefusedAndTheOthersReachTheHandler) {
  const std::string wrong = validate("wrongNumberOfInputs");
  for (const Command& command : commands()) {
    const std::size_t least = command.minimum(), most = command.maximum();
    for (std::size_t count = 0; count <= most + 1; ++count) {
      const bool suits = count >= least && count <= most;
      EXPECT_EQ(errorOf(command.name, Arguments(count)) != wrong, suits) << command << count;
    }
  }
}

TEST_F(CommandTableTest, NamesMatchWhollyAndInTheirCase) {
  for (const char* name : {"Open", "OPEN", "ope", "openn", "open ", " open", "", "getvar"})
    EXPECT_EQ(errorOf(name, {"a"}), cdflib("invalidOperation", name));
}

TEST_F(CommandTableTest, AnUnknownCommandComesBeforeAWrongCount) {
  EXPECT_EQ(errorOf("fly", Arguments(20)), cdflib("invalidOperation", "fly"));
}

TEST_F(CommandTableTest, LookUpFindsTheRow) {
  using TOLVEX::ambrix::lookupCommand;
  EXPECT_EQ(lookupCommand("getVarData", 3).id, 50);
  EXPECT_EQ(lookupCommand("getVarData", 4).id, 50);
  EXPECT_EQ(lookupCommand("getConstantValue", 1).id, 92);
}

}  // namespace
}  // namespace ambrix_test
