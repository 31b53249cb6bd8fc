// "putVarRecordData" and "deleteVarRecords": whole records.
#include "tests/module/support/file_bytes.h"
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

/// Begins with a row-major file.
class WriteRecordsTest : public ModuleTest {
 protected:
  Given file = create();
};

std::string writingRecordFailed(const char* text) {
  return refused("CDFputzVarRecordData", text);
}
std::string wrongNumberInRecord(long expected) {
  return cdflib("wrongNumberOfPutVarRecordDataElements", "v", expected);
}

TEST_F(WriteRecordsTest, ElementsAreWrittenInStorageOrderInBothMajorities) {
  const auto values = row<std::int32_t>({1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12});
  for (const Given& target : {file, createColumnMajor("columns")}) {
    const double variable = createVar(target, {.sizes = {3, 4}});
    EXPECT_EQ(does("putVarRecordData", {target, variable, 0, values}), "done");
    EXPECT_EQ(does("getVarRecordData", {target, variable, 0}),
              "int32 3x4 [1 2 3 4 5 6 7 8 9 10 11 12]");
    results("close", {target});
  }
  const std::string expected = bytesOf<std::int32_t>({1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12});
  EXPECT_THAT(fileBytes("new.cdf"), testing::HasSubstr(expected));
  EXPECT_THAT(fileBytes("columns.cdf"), testing::HasSubstr(expected));
}

TEST_F(WriteRecordsTest, AnyShapeOfTheRightNumberServes) {
  const double variable = createVar(file, {.sizes = {3, 2}});
  const std::vector<std::int32_t> values = {1, 2, 3, 4, 5, 6};
  for (const std::vector<std::size_t>& sizes :
       {std::vector<std::size_t>{1, 6}, {6, 1}, {2, 3}, {3, 2}, {1, 2, 3}}) {
    EXPECT_EQ(does("putVarRecordData", {file, variable, 0, Array::of<std::int32_t>(values, sizes)}),
              "done");
    EXPECT_EQ(does("getVarRecordData", {file, variable, 0}), "int32 3x2 [1 2 3 4 5 6]");
  }
}

TEST_F(WriteRecordsTest, ARecordThatWasReadWritesBackUnchanged) {
  const Given example = open(distributionSample("example1.cdf"));
  const double variable = createVar(file, {.sizes = {20, 10}});
  results("putVarRecordData", {file, variable, 0, result("getVarRecordData", {example, 2, 0})});
  EXPECT_EQ(does("getVarRecordData", {file, variable, 0}),
            does("getVarRecordData", {example, 2, 0}));
  EXPECT_EQ(does("getVarData", {file, variable, 0, {3, 2}}), "int32 1x1 [43]");
}

TEST_F(WriteRecordsTest, TextsAreWrittenWholeWithTheLowByteOfEachCharacter) {
  const double variable = createVar(file, {.datatype = 51, .sizes = {2}, .elements = 8});
  const Given texts = Array::text(u"abcdefg\u20ACcaf\u00E9 XYZ");
  EXPECT_EQ(does("putVarRecordData", {file, variable, 0, texts}), "done");
  EXPECT_EQ(does("putVarRecordData", {file, variable, 0, "too short"}), wrongNumberInRecord(16));
  EXPECT_EQ(does("getVarRecordData", {file, variable, 0}),
            "char 8x2 'abcdefg\\xFFACcaf\\xFFE9 XYZ'");
  results("close", {file});
  EXPECT_THAT(fileBytes("new.cdf"), testing::HasSubstr("abcdefg\xAC"
                                                       "caf\xE9 XYZ"));
}

TEST_F(WriteRecordsTest, ANegativeRecordIsRefusedAndTheFileStaysUsable) {
  const double variable = createVar(file, {.datatype = 22});
  results("putVarRecordData", {file, variable, 0, 7});
  for (const double record : {-1.0, -9.0, 4294967296.0, 2147483648.0}) {
    EXPECT_EQ(does("putVarRecordData", {file, variable, record, 5}),
              writingRecordFailed(kBadRecNum));
  }
  EXPECT_EQ(does("getVarRecordData", {file, variable, 0}), "double 1x1 [7]");
  EXPECT_EQ(does("getVarRecordData", {reopen(file), variable, 0}), "double 1x1 [7]");
}

TEST_F(WriteRecordsTest, RecordsSkippedReadAsPadValues) {
  const double variable = createVar(file, {});
  results("setVarPadValue", {file, variable, row<std::int32_t>({-1})});
  results("putVarRecordData", {file, variable, 3, row<std::int32_t>({5})});
  EXPECT_EQ(does("hyperGetVarData", {file, variable, 0, 5, 1, {}, {}, {}}),
            "int32 5x1 [-1 -1 -1 5 -1]");
}

TEST_F(WriteRecordsTest, WithoutRecordVarianceThereIsOneRecordForAll) {
  const double variable = createVar(file, {.recordsVary = false});
  results("putVarRecordData", {file, variable, 4, row<std::int32_t>({5})});
  EXPECT_EQ(does("getVarData", {file, variable, 0}), "int32 1x1 [5]");
  EXPECT_EQ(does("getVarNumRecsWritten", {file, variable}), "double 1x1 [1]");
}

TEST_F(WriteRecordsTest, OversizedRecordsAreRefused) {
  results("createVar", {file, "v", 45, 1, {65536, 32768}, -1, {-1, 0}});
  const double huge = 0;
  EXPECT_EQ(does("putVarRecordData", {file, huge, 0, {1}}), wrongNumberInRecord(2147483648));
}

TEST_F(WriteRecordsTest, DeletingRecordsMovesTheLaterOnesDown) {
  const double variable = createVar(file, {});
  results("hyperPutVarData",
          {file, variable, 0, 5, 1, {}, {}, {}, row<std::int32_t>({0, 1, 2, 3, 4})});
  EXPECT_EQ(does("deleteVarRecords", {file, variable, 1, 2}), "done");
  EXPECT_EQ(does("hyperGetVarData", {file, variable, 0, 3, 1, {}, {}, {}}), "int32 3x1 [0 3 4]");
  EXPECT_EQ(does("getVarMaxWrittenRecNum", {file, variable}), "double 1x1 [2]");
}

TEST_F(WriteRecordsTest, TheRangeToDeleteIsTheLibrarysToJudge) {
  const double variable = createVar(file, {});
  results("putVarRecordData", {file, variable, 2, row<std::int32_t>({1})});
  const std::string error = refused("CDFdeletezVarRecords", kBadRecNum);
  EXPECT_EQ(does("deleteVarRecords", {file, variable, -1, 0}), error);
  EXPECT_EQ(does("deleteVarRecords", {file, variable, 2, 1}), error);
  EXPECT_EQ(does("deleteVarRecords", {file, variable, 4294967296.0, 4294967296.0}), error);
  EXPECT_EQ(does("deleteVarRecords", {file, variable, 0, 4294967296.0}), error);
  EXPECT_EQ(does("deleteVarRecords", {file, 4294967296.0, 0, 0}),
            refused("CDFdeletezVarRecords", kNoSuchVar));
  EXPECT_EQ(does("getVarNumRecsWritten", {file, variable}), "double 1x1 [3]");
}

}  // namespace
}  // namespace ambrix_test
