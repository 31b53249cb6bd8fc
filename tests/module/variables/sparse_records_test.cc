// Records that are not stored, and what is read in their place.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

/// Begins with a variable 0 whose pad value is -1.
class SparseRecordsTest : public ModuleTest {
 protected:
  SparseRecordsTest() {
    createVar(file, {});
    results("setVarPadValue", {file, 0, row<std::int32_t>({-1})});
  }
  void writeRecordsTwoAndFive() {
    results("putVarRecordData", {file, 0, 2, row<std::int32_t>({2})});
    results("putVarRecordData", {file, 0, 5, row<std::int32_t>({5})});
  }
  Given file = create();
};

TEST_F(SparseRecordsTest, ModesAreNamed) {
  EXPECT_EQ(does("getVarSparseRecords", {file, 0}), "char 1x16 'NO_SPARSERECORDS'");
  EXPECT_EQ(does("setVarSparseRecords", {file, 0, 1}), "done");
  EXPECT_EQ(does("getVarSparseRecords", {file, 0}), "char 1x17 'PAD_SPARSERECORDS'");
  EXPECT_EQ(does("setVarSparseRecords", {file, 0, 2}), "done");
  EXPECT_EQ(does("getVarSparseRecords", {file, 0}), "char 1x18 'PREV_SPARSERECORDS'");
}

TEST_F(SparseRecordsTest, OtherModesAreTheLibrarysToRefuse) {
  for (const double mode : {3.0, -1.0, 4294967297.0}) {
    EXPECT_EQ(does("setVarSparseRecords", {file, 0, mode}),
              refused("CDFsetzVarSparseRecords", kUnknownSparseness));
  }
}

TEST_F(SparseRecordsTest, TheModeIsFixedOnceThereAreRecords) {
  writeRecordsTwoAndFive();
  EXPECT_EQ(does("setVarSparseRecords", {file, 0, 1}),
            refused("CDFsetzVarSparseRecords", kCannotSparserecords));
}

TEST_F(SparseRecordsTest, MissingRecordsReadAsPadValues) {
  results("setVarSparseRecords", {file, 0, 1});
  writeRecordsTwoAndFive();
  EXPECT_EQ(does("hyperGetVarData", {file, 0, 0, 7, 1, {}, {}, {}}),
            "int32 7x1 [-1 -1 2 -1 -1 5 -1]");
  EXPECT_EQ(does("getVarData", {file, 0, 3}), "int32 1x1 [-1]");
  EXPECT_EQ(does("getVarRecordData", {file, 0, 3}), "int32 1x1 [-1]");
}

TEST_F(SparseRecordsTest, MissingRecordsReadAsThePreviousOne) {
  results("setVarSparseRecords", {file, 0, 2});
  writeRecordsTwoAndFive();
  EXPECT_EQ(does("getVarData", {file, 0, 1}), "int32 1x1 [-1]");
  EXPECT_EQ(does("getVarData", {file, 0, 3}), "int32 1x1 [2]");
  EXPECT_EQ(does("hyperGetVarData", {file, 0, 2, 4, 1, {}, {}, {}}), "int32 4x1 [2 2 2 5]");
}

TEST_F(SparseRecordsTest, OnlyStoredRecordsAreCounted) {
  results("setVarSparseRecords", {file, 0, 1});
  writeRecordsTwoAndFive();
  EXPECT_EQ(does("getVarNumRecsWritten", {file, 0}), "double 1x1 [2]");
  EXPECT_EQ(does("getVarMaxWrittenRecNum", {file, 0}), "double 1x1 [5]");
}

TEST_F(SparseRecordsTest, DeletedRecordsLeaveTheOthersInPlace) {
  results("setVarSparseRecords", {file, 0, 1});
  writeRecordsTwoAndFive();
  EXPECT_EQ(does("deleteVarRecords", {file, 0, 2, 2}), "done");
  EXPECT_EQ(does("getVarData", {file, 0, 2}), "int32 1x1 [-1]");
  EXPECT_EQ(does("getVarData", {file, 0, 5}), "int32 1x1 [5]");
}

TEST_F(SparseRecordsTest, ANegativeRecordDoesNotDamageTheFile) {
  results("setVarSparseRecords", {file, 0, 1});
  writeRecordsTwoAndFive();
  EXPECT_EQ(does("putVarRecordData", {file, 0, -1, row<std::int32_t>({9})}),
            refused("CDFputzVarRecordData", kBadRecNum));
  EXPECT_EQ(does("getVarData", {reopen(file), 0, 5}), "int32 1x1 [5]");
}

TEST_F(SparseRecordsTest, SparseVariablesOfOthersAreRead) {
  AMBRIX_NEED_SAMPLE(path, "nasajava_test.cdf");
  const Given others = open(path);
  const double sparse = number("getVarNum", {others, "Temp"});
  EXPECT_EQ(does("getVarSparseRecords", {others, sparse}), "char 1x17 'PAD_SPARSERECORDS'");
  EXPECT_EQ(does("getVarRecordData", {others, sparse, 0}),
            "single 3x1 [55.5 -1.00000002e+30 66.5999985]");
  EXPECT_EQ(does("getVarRecordData", {others, sparse, 3}),
            "single 3x1 [-1.00000002e+30 -1.00000002e+30 -1.00000002e+30]");
}

}  // namespace
}  // namespace ambrix_test
