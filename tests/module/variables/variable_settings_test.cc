// Storage settings and record counts of variables.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

/// Begins with a single file that has variable 0.
class VariableSettingsTest : public ModuleTest {
 protected:
  VariableSettingsTest() { createVar(file, {}); }
  Given file = create();
};

const std::string kInappropriate = "TOLVEX:ambrix:cdflib:varCacheSizeOpInappropriate()";
const Given kOne = row<std::int32_t>({1});

TEST_F(VariableSettingsTest, WithoutRecordsTheHighestIsMinusOne) {
  EXPECT_EQ(does("getVarMaxWrittenRecNum", {file, 0}), "double 1x1 [-1]");
  EXPECT_EQ(does("getVarsMaxWrittenRecNum", {file}), "double 1x1 [-1]");
  EXPECT_EQ(does("getVarNumRecsWritten", {file, 0}), "double 1x1 [0]");
  EXPECT_EQ(does("getVarAllocRecords", {file, 0}), "double 1x1 [0]");
  EXPECT_EQ(does("getVarMaxAllocRecNum", {file, 0}), "double 1x1 [-1]");
}

TEST_F(VariableSettingsTest, RecordsAreCountedFromZero) {
  createVar(file, {.name = "w"});
  results("putVarRecordData", {file, 0, 4, kOne});
  results("putVarRecordData", {file, 1, 6, kOne});
  EXPECT_EQ(does("getVarMaxWrittenRecNum", {file, 0}), "double 1x1 [4]");
  EXPECT_EQ(does("getVarNumRecsWritten", {file, 0}), "double 1x1 [5]");
  EXPECT_EQ(does("getVarsMaxWrittenRecNum", {file}), "double 1x1 [6]");
  EXPECT_GE(number("getVarAllocRecords", {file, 0}), 5);
  EXPECT_GE(number("getVarMaxAllocRecNum", {file, 0}), 4);
}

TEST_F(VariableSettingsTest, TheBlockingFactorCanBeSet) {
  EXPECT_EQ(does("setVarBlockingFactor", {file, 0, 12.7}), "done");
  EXPECT_EQ(does("getVarBlockingFactor", {file, 0}), "double 1x1 [12]");
  EXPECT_EQ(does("setVarBlockingFactor", {file, 0, -1}),
            refused("CDFsetzVarBlockingFactor", kBadBlockingFactor));
  EXPECT_EQ(does("setVarBlockingFactor", {file, 0, 4294967297.0}),
            refused("CDFsetzVarBlockingFactor", kBadBlockingFactor));
}

TEST_F(VariableSettingsTest, InitialRecordsAreWrittenOnce) {
  EXPECT_EQ(does("setVarInitialRecs", {file, 0, 5}), "done");
  EXPECT_EQ(does("getVarNumRecsWritten", {file, 0}), "double 1x1 [5]");
  EXPECT_EQ(does("setVarInitialRecs", {file, 0, 6}),
            refused("CDFsetzVarInitialRecs", kCannotChange));
}

TEST_F(VariableSettingsTest, BadNumbersOfInitialRecordsAreRefused) {
  EXPECT_EQ(does("setVarInitialRecs", {file, 0, -1}),
            refused("CDFsetzVarInitialRecs", kBadInitialRecs));
  EXPECT_EQ(does("setVarInitialRecs", {file, 0, 4294967298.0}),
            refused("CDFsetzVarInitialRecs", kBadInitialRecs));
  EXPECT_EQ(does("getVarNumRecsWritten", {file, 0}), "double 1x1 [0]");
}

TEST_F(VariableSettingsTest, BlocksOfRecordsAreAllocatedFromFirstToLast) {
  EXPECT_EQ(does("setVarAllocBlockRecords", {file, 0, 10, 14}), "done");
  EXPECT_EQ(does("getVarAllocRecords", {file, 0}), "double 1x1 [15]");
  EXPECT_EQ(does("getVarMaxAllocRecNum", {file, 0}), "double 1x1 [14]");
  EXPECT_EQ(does("getVarNumRecsWritten", {file, 0}), "double 1x1 [0]");
}

TEST_F(VariableSettingsTest, BadBlocksAreTheLibrarysToRefuse) {
  const char* routine = "CDFsetzVarAllocBlockRecords";
  EXPECT_EQ(does("setVarAllocBlockRecords", {file, 0, -1, 3}), refused(routine, kBadAllocateRecs));
  EXPECT_EQ(does("setVarAllocBlockRecords", {file, 0, 4294967296.0, 4294967299.0}),
            refused(routine, kBadAllocateRecs));
  EXPECT_EQ(does("getVarAllocRecords", {file, 0}), "double 1x1 [0]");
}

TEST_F(VariableSettingsTest, OnlyCompressedVariablesHaveAReserve) {
  EXPECT_EQ(does("getVarReservePercent", {file, 0}),
            refused("CDFgetzVarReservePercent", kNaForVariable));
  EXPECT_EQ(does("setVarReservePercent", {file, 0, 20}),
            refused("CDFsetzVarReservePercent", kNaForVariable));
  createVar(file, {.name = "compressed"});
  results("setVarCompression", {file, 1, 5, 6});
  EXPECT_EQ(does("setVarReservePercent", {file, 1, 20.5}), "done");
  EXPECT_EQ(does("getVarReservePercent", {file, 1}), "double 1x1 [20]");
}

TEST_F(VariableSettingsTest, CacheSizesAreForMultiFiles) {
  EXPECT_EQ(does("getVarCacheSize", {file, 0}), kInappropriate);
  EXPECT_EQ(does("setVarCacheSize", {file, 0, 5}), kInappropriate);
  EXPECT_EQ(does("getVarCacheSize", {file, 99}), kInappropriate);
  const Given multi = createMultiFile("multi");
  createVar(multi, {});
  EXPECT_EQ(does("getVarCacheSize", {multi, 0}), "double 1x1 [1]");
  EXPECT_EQ(does("setVarCacheSize", {multi, 0, 5}), "done");
  EXPECT_EQ(does("getVarCacheSize", {multi, 0}), "double 1x1 [5]");
  EXPECT_EQ(does("setVarCacheSize", {multi, 0, -1}), refused("CDFsetzVarCacheSize", kBadCacheSize));
  EXPECT_EQ(does("setVarCacheSize", {multi, 0, 4294967301.0}),
            refused("CDFsetzVarCacheSize", kBadCacheSize));
}

// A record of 2^32 values has a size of 0 to the library, which divides by it.
TEST_F(VariableSettingsTest, VariablesWithOversizedRecordsAreRefusedWhereTheLibraryWouldDivide) {
  createVar(file, {.sizes = {65536, 65536}, .name = "huge"});
  EXPECT_EQ(does("setVarBlockingFactor", {file, 1, 2}),
            refused("CDFsetzVarBlockingFactor", kBadDimSize));
  EXPECT_EQ(does("setVarInitialRecs", {file, 1, 1}), refused("CDFsetzVarInitialRecs", kBadDimSize));
  EXPECT_EQ(does("setVarAllocBlockRecords", {file, 1, 0, 1}),
            refused("CDFsetzVarAllocBlockRecords", kBadDimSize));
  EXPECT_EQ(does("deleteVarRecords", {file, 1, 0, 0}),
            refused("CDFdeletezVarRecords", kBadDimSize));
  EXPECT_EQ(does("getVarNumRecsWritten", {file, 1}), "double 1x1 [0]");
}

TEST_F(VariableSettingsTest, DeletingRecordsOfAMultiFileDoesNothing) {
  const Given multi = createMultiFile("multi");
  createVar(multi, {});
  results("putVarRecordData", {multi, 0, 0, kOne});
  EXPECT_EQ(does("deleteVarRecords", {multi, 0, 0, 0}), "done");
  EXPECT_EQ(does("getVarNumRecsWritten", {multi, 0}), "double 1x1 [1]");
}

}  // namespace
}  // namespace ambrix_test
