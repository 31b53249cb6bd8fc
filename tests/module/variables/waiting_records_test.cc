// Records of compressed sparse variables that wait to be written when others are read: the library
// fills in all records up to them.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using testing::HasSubstr;

constexpr int kPad = 1, kPrevious = 2, kGzip = 5, kReadOnlyOn = -1;

class WaitingRecordsTest : public ModuleTest, public testing::WithParamInterface<int> {
 protected:
  WaitingRecordsTest() {
    v = createVar(file, {.datatype = 22, .sizes = {2}});
    results("setVarSparseRecords", {file, v, GetParam()});
    results("setVarCompression", {file, v, kGzip, 6});
    results("putVarRecordData", {file, v, 2, row<double>({1, 2})});
    results("putVarRecordData", {file, v, 60000, row<double>({3, 4})});
  }
  const std::string missing = GetParam() == kPad ? "[-1e+30 -1e+30]" : "[1 2]";
  Given file = create();
  double v = 0;
};

TEST_P(WaitingRecordsTest, RecordsThatAreMissingAreReadAlone) {
  EXPECT_EQ(does("getVarRecordData", {file, v, 4}), "double 2x1 " + missing);
  EXPECT_EQ(does("getVarRecordData", {file, v, 60000}), "double 2x1 [3 4]");
  EXPECT_EQ(does("getVarNumRecsWritten", {file, v}), "double 1x1 [2]");
}

TEST_P(WaitingRecordsTest, SoAreHyperslabs) {
  EXPECT_EQ(does("hyperGetVarData", {file, v, 4, 1, 1, 0, 2, 1}), "double 2x1 " + missing);
  EXPECT_EQ(does("hyperGetVarData", {file, v, 59999, 1, 1, 0, 2, 1}), "double 2x1 " + missing);
}

TEST_P(WaitingRecordsTest, PartsOfThemCanBeWritten) {
  results("hyperPutVarData", {file, v, 4, 1, 1, 1, 1, 1, 9});
  const std::string first = GetParam() == kPad ? "-1e+30" : "1";
  EXPECT_EQ(does("getVarRecordData", {file, v, 4}), "double 2x1 [" + first + " 9]");
  const Given again = reopen(file);
  EXPECT_EQ(does("getVarRecordData", {again, v, 4}), "double 2x1 [" + first + " 9]");
  EXPECT_EQ(does("getVarRecordData", {again, v, 60000}), "double 2x1 [3 4]");
}

TEST_P(WaitingRecordsTest, NoneWaitAfterWritingWasRefused) {
  const Given again = reopen(file);
  results("setReadOnlyMode", {again, kReadOnlyOn});
  EXPECT_THAT(does("putVarRecordData", {again, v, 4, row<double>({5, 6})}),
              HasSubstr("READ_ONLY_MODE"));
  EXPECT_EQ(does("getVarRecordData", {again, v, 4}), "double 2x1 " + missing);
  EXPECT_EQ(does("getVarRecordData", {again, v, 60000}), "double 2x1 [3 4]");
}

INSTANTIATE_TEST_SUITE_P(Sparseness, WaitingRecordsTest, testing::Values(kPad, kPrevious));

}  // namespace
}  // namespace ambrix_test
