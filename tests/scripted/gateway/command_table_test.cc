// The 91 commands, restated.
#include "gateway/entry/command_table.h"

#include <map>
#include <set>
#include <string>

#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using CommandTableTest = ScriptedTest;

struct Row {
  int id;
  const char* name;
  int minimum;
  int maximum;
};

// clang-format off
const Row kRows[] = {
    {0, "close", 1, 1}, {1, "closeVar", 2, 2}, {2, "computeEpoch", 1, 1},
    {3, "computeEpoch16", 1, 1}, {4, "create", 1, 1}, {5, "createAttr", 3, 3},
    {6, "createVar", 7, 7}, {7, "delete", 1, 1}, {8, "deleteAttr", 2, 2},
    {9, "deleteAttrEntry", 3, 3}, {10, "deleteAttrgEntry", 3, 3}, {11, "deleteVar", 2, 2},
    {12, "deleteVarRecords", 4, 4}, {13, "epochBreakdown", 1, 1}, {14, "epoch16Breakdown", 1, 1},
    {19, "getAttrName", 2, 2}, {20, "getAttrNum", 2, 2}, {15, "getAttrgEntry", 3, 3},
    {17, "getAttrMaxEntry", 2, 2}, {18, "getAttrMaxgEntry", 2, 2}, {21, "getAttrScope", 2, 2},
    {16, "getAttrEntry", 3, 3}, {22, "getCacheSize", 1, 1}, {23, "getChecksum", 1, 1},
    {24, "getCompression", 1, 1}, {25, "getCompressionCacheSize", 1, 1}, {26, "getCopyright", 1, 1},
    {27, "getFileBackward", 0, 0}, {28, "getFormat", 1, 1}, {30, "getLibraryVersion", 0, 0},
    {29, "getLibraryCopyright", 0, 0}, {31, "getMajority", 1, 1}, {34, "getName", 1, 1},
    {35, "getNumAttrgEntries", 2, 2}, {36, "getNumAttrEntries", 2, 2},
    {37, "getNumgAttributes", 1, 1}, {38, "getNumvAttributes", 1, 1},
    {39, "getReadOnlyMode", 1, 1}, {40, "getStageCacheSize", 1, 1}, {41, "getValidate", 0, 0},
    {42, "getVarAllocRecords", 2, 2}, {43, "getVarCacheSize", 2, 2}, {44, "getVarName", 2, 2},
    {32, "getVarNum", 2, 2}, {45, "getVarPadValue", 2, 2}, {33, "getVarReservePercent", 2, 2},
    {46, "getVersion", 1, 1}, {48, "getVarBlockingFactor", 2, 2}, {49, "getVarCompression", 2, 2},
    {50, "getVarData", 3, 4}, {52, "getVarMaxWrittenRecNum", 2, 2},
    {51, "getVarMaxAllocRecNum", 2, 2}, {53, "getVarNumRecsWritten", 2, 2},
    {54, "getVarRecordData", 3, 3}, {55, "getVarsMaxWrittenRecNum", 1, 1},
    {56, "getVarSparseRecords", 2, 2}, {58, "hyperGetVarData", 8, 8}, {57, "hyperPutVarData", 9, 9},
    {59, "inquire", 1, 1}, {63, "inquireVar", 2, 2}, {60, "inquireAttr", 2, 2},
    {61, "inquireAttrgEntry", 3, 3}, {62, "inquireAttrEntry", 3, 3}, {64, "open", 1, 1},
    {65, "putAttrEntry", 5, 5}, {66, "putAttrgEntry", 5, 5}, {67, "putVarData", 5, 5},
    {68, "putVarRecordData", 4, 4}, {69, "renameAttr", 3, 3}, {70, "renameVar", 3, 3},
    {71, "setCacheSize", 2, 2}, {72, "setChecksum", 2, 2}, {73, "setCompression", 2, 3},
    {74, "setCompressionCacheSize", 2, 2}, {75, "setFileBackward", 1, 1}, {76, "setFormat", 2, 2},
    {77, "setMajority", 2, 2}, {78, "setReadOnlyMode", 2, 2}, {89, "setStageCacheSize", 2, 2},
    {79, "setValidate", 1, 1}, {80, "setVarAllocBlockRecords", 4, 4},
    {82, "setVarBlockingFactor", 3, 3}, {83, "setVarCacheSize", 3, 3},
    {84, "setVarsCacheSize", 2, 2}, {86, "setVarPadValue", 3, 3},
    {87, "setVarReservePercent", 3, 3}, {88, "setVarSparseRecords", 3, 3},
    {85, "setVarInitialRecs", 3, 3}, {90, "setVarCompression", 3, 4},
    {91, "getConstantNames", 0, 0}, {92, "getConstantValue", 1, 1},
};
// clang-format on
static_assert(std::size(kRows) == 91);

TEST_F(CommandTableTest, RowsIdsNamesAndCountsAreAsDocumentedInOrder) {
  const auto table = TOLVEX::ambrix::commandTable();
  ASSERT_EQ(table.size(), std::size(kRows));
  for (std::size_t i = 0; i < table.size(); ++i) {
    EXPECT_STREQ(table[i].name, kRows[i].name);
    EXPECT_EQ(table[i].id, kRows[i].id) << kRows[i].name;
    EXPECT_EQ(table[i].minimumArguments, kRows[i].minimum) << kRows[i].name;
    EXPECT_EQ(table[i].maximumArguments, kRows[i].maximum) << kRows[i].name;
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

TEST_F(CommandTableTest, TooFewAndTooManyArgumentsAreRefusedWithoutTellingWhich) {
  for (const Row& row : kRows) {
    const auto minimum = static_cast<std::size_t>(row.minimum);
    const auto maximum = static_cast<std::size_t>(row.maximum);
    if (minimum > 0) {
      EXPECT_EQ(errorOf(row.name, Arguments(minimum - 1)), validate("wrongNumberOfInputs"));
    }
    EXPECT_EQ(errorOf(row.name, Arguments(maximum + 1)), validate("wrongNumberOfInputs"));
  }
  EXPECT_THAT(calls(), testing::IsEmpty());
}

TEST_F(CommandTableTest, TheAllowedCountsReachTheHandler) {
  for (const Row& row : kRows) {
    for (int count = std::max(row.minimum, 1); count <= row.maximum; ++count) {
      const std::string error = errorOf(row.name, Arguments(static_cast<std::size_t>(count)));
      EXPECT_NE(error, validate("wrongNumberOfInputs")) << row.name;
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
