// Writing and reading the last record that 32 bits can number.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

constexpr double kLast = 2147483647;

class LastRecordTest : public ModuleTest {
 protected:
  static constexpr const char* kNames[] = {"dense", "pad", "previous"};
  Given file = create();
};

TEST_F(LastRecordTest, IsRefusedAndTheFileStaysUsable) {
  const double v = createVar(file, {.datatype = 22});
  results("putVarData", {file, v, 3, {}, 7});
  EXPECT_EQ(does("putVarData", {file, v, kLast, {}, 1}), refused("CDFputzVarData", kBadRecNum));
  EXPECT_EQ(does("putVarRecordData", {file, v, kLast, 1}),
            refused("CDFputzVarRecordData", kBadRecNum));
  EXPECT_EQ(does("hyperPutVarData", {file, v, kLast - 1, 2, 1, {}, {}, {}, {1, 2}}),
            refused("CDFhyperPutzVarData", kBadRecNum));
  EXPECT_EQ(does("getVarData", {reopen(file), v, 3}), "double 1x1 [7]");
}

TEST_F(LastRecordTest, IsNotReadWhereRecordsAreSparseOrCompressedEither) {
  for (const double sparse : {0.0, 1.0, 2.0}) {
    const double v = createVar(file, {.datatype = 22, .name = kNames[static_cast<int>(sparse)]});
    results("setVarSparseRecords", {file, v, sparse});
    results("setVarCompression", {file, v, 5, 1});
    results("putVarData", {file, v, 3, {}, 7});
    EXPECT_EQ(does("getVarData", {file, v, kLast}), refused("CDFgetzVarData", kBadRecNum));
    EXPECT_EQ(does("getVarRecordData", {file, v, kLast}),
              refused("CDFgetzVarRecordData", kBadRecNum));
    EXPECT_EQ(does("hyperGetVarData", {file, v, 3, 2, kLast - 3, {}, {}, {}}),
              refused("CDFhyperGetzVarData", kBadRecNum));
    EXPECT_EQ(does("getVarData", {file, v, 3}), "double 1x1 [7]");
  }
}

TEST_F(LastRecordTest, TheOneBeforeReadsAsThePadValue) {
  const double v = createVar(file, {.datatype = 22});
  results("setVarSparseRecords", {file, v, 1});
  results("setVarPadValue", {file, v, -1});
  EXPECT_EQ(does("getVarData", {file, v, kLast - 1}), "double 1x1 [-1]");
  EXPECT_EQ(does("getVarRecordData", {file, v, kLast - 1}), "double 1x1 [-1]");
}

TEST_F(LastRecordTest, WithoutRecordVarianceItIsTheOnlyOne) {
  const double v = createVar(file, {.datatype = 22, .recordsVary = false});
  results("putVarRecordData", {file, v, kLast, 7});
  EXPECT_EQ(does("getVarRecordData", {file, v, kLast}), "double 1x1 [7]");
  EXPECT_EQ(does("getVarData", {reopen(file), v, 0}), "double 1x1 [7]");
}

}  // namespace
}  // namespace ambrix_test
