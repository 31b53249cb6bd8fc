// Records of compressed sparse variables that wait to be written when others are read: the library
// fills in all records up to them.
#include <fstream>

#include "tests/module/support/file_bytes.h"
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

// What waits goes on waiting: the answers that follow are those of a library that was not asked.
TEST_P(WaitingRecordsTest, ReadingWholeRecordsWritesNothing) {
  if (GetParam() == kPrevious) GTEST_SKIP() << "the library itself writes to find the previous one";
  const auto told = [&] {
    return does("getVarMaxAllocRecNum", {file, v}) + does("getVarCompression", {file, v});
  };
  const std::string before = told();
  does("getVarRecordData", {file, v, 4});
  does("getVarRecordData", {file, v, 60000});
  does("hyperGetVarData", {file, v, 59900, 4, 2, 0, 2, 1});
  does("getVarData", {file, v, 4, 1});
  EXPECT_EQ(told(), before);
}

// The library reads those one by one.
TEST_P(WaitingRecordsTest, RecordsApartAreReadAloneAlsoIfTheLastOneWaits) {
  EXPECT_EQ(does("hyperGetVarData", {file, v, 4, 2, 59996, 0, 2, 1}),
            "double 2x2 [" + missing.substr(1, missing.size() - 2) + " 3 4]");
  EXPECT_EQ(does("hyperGetVarData", {file, v, 4, 400, 2, 0, 2, 1}).substr(0, 15),
            "double 2x400 [" + missing.substr(1, 1));
}

TEST_P(WaitingRecordsTest, PartsAreReadAloneInReadOnlyModeToo) {
  results("setReadOnlyMode", {file, kReadOnlyOn});
  const std::string first = GetParam() == kPad ? "-1e+30" : "1";
  EXPECT_EQ(does("hyperGetVarData", {file, v, 4, 1, 1, 0, 1, 1}), "double 1x1 [" + first + "]");
  EXPECT_EQ(does("getVarRecordData", {file, v, 4}), "double 2x1 " + missing);
}

TEST_P(WaitingRecordsTest, RecordsOfOneValueAreReadAlone) {
  const double scalar = createVar(file, {.datatype = 22, .name = "scalar"});
  results("setVarSparseRecords", {file, scalar, GetParam()});
  results("setVarCompression", {file, scalar, kGzip, 6});
  results("putVarData", {file, scalar, 2, {}, 1});
  results("putVarData", {file, scalar, 60000, {}, 3});
  const std::string filled = GetParam() == kPad ? "-1e+30" : "1";
  EXPECT_EQ(does("getVarData", {file, scalar, 4}), "double 1x1 [" + filled + "]");
  EXPECT_EQ(does("hyperGetVarData", {file, scalar, 2, 2, 2, {}, {}, {}}),
            "double 2x1 [1 " + filled + "]");
}

// One value is stored, and repeated along the dimension.
TEST_P(WaitingRecordsTest, SoAreThoseOfOneStoredValue) {
  const double same =
      createVar(file, {.datatype = 22, .sizes = {3}, .name = "same", .variances = {0}});
  results("setVarSparseRecords", {file, same, GetParam()});
  results("setVarCompression", {file, same, kGzip, 6});
  results("hyperPutVarData", {file, same, 2, 1, 1, 0, 1, 1, 1});
  results("hyperPutVarData", {file, same, 60000, 1, 1, 0, 1, 1, 3});
  const std::string filled = GetParam() == kPad ? "[-1e+30 -1e+30 -1e+30]" : "[1 1 1]";
  EXPECT_EQ(does("hyperGetVarData", {file, same, 4, 1, 1, 0, 3, 1}), "double 3x1 " + filled);
}

TEST_P(WaitingRecordsTest, SoAreThoseFarBeforeThem) {
  results("putVarRecordData", {file, v, 30000000, row<double>({5, 6})});
  EXPECT_EQ(does("getVarRecordData", {file, v, 61000}),
            "double 2x1 " + std::string(GetParam() == kPad ? "[-1e+30 -1e+30]" : "[3 4]"));
}

TEST_P(WaitingRecordsTest, NoneWaitAfterWritingWasRefused) {
  const Given again = reopen(file);
  results("setReadOnlyMode", {again, kReadOnlyOn});
  EXPECT_THAT(does("putVarRecordData", {again, v, 4, row<double>({5, 6})}),
              HasSubstr("READ_ONLY_MODE"));
  EXPECT_EQ(does("getVarRecordData", {again, v, 4}), "double 2x1 " + missing);
  EXPECT_EQ(does("getVarRecordData", {again, v, 60000}), "double 2x1 [3 4]");
}

// A file of an older version would be stamped with the new one if anything were written.
TEST_P(WaitingRecordsTest, AFileInWhichAllWritingWasRefusedStaysAsItIs) {
  results("close", {file});
  constexpr std::streamoff kIncrement = 8 + 48;  // of the library's version, in the first record
  std::fstream("new.cdf", std::ios::in | std::ios::out | std::ios::binary)
      .seekp(kIncrement + 3)
      .put('\0');
  const std::string before = fileBytes("new.cdf");
  for (const bool readOnly : {false, true}) {
    const Given again = open("new");
    if (readOnly) results("setReadOnlyMode", {again, kReadOnlyOn});
    EXPECT_THAT(does("putVarData", {again, v, -1, 0, 5}), HasSubstr("libraryFailure"));
    EXPECT_THAT(does("putVarRecordData", {again, v, readOnly ? 4.0 : -1.0, row<double>({5, 6})}),
                HasSubstr("libraryFailure"));
    EXPECT_THAT(does("setVarReservePercent", {again, v, -5}), HasSubstr("libraryFailure"));
    does("getVarRecordData", {again, v, 4});
    does("hyperGetVarData", {again, v, 4, 1, 1, 0, 1, 1});
    does("hyperGetVarData", {again, v, 2, 1, 1, 0, 2, 1});
    results("close", {again});
    EXPECT_EQ(fileBytes("new.cdf"), before);
  }
}

INSTANTIATE_TEST_SUITE_P(Sparseness, WaitingRecordsTest, testing::Values(kPad, kPrevious));

}  // namespace
}  // namespace ambrix_test
