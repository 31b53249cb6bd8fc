// "hyperPutVarData": strided blocks of records and dimensions.
#include "tests/module/support/file_bytes.h"
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

/// Begins with a row-major file.
class WriteHyperslabsTest : public ModuleTest {
 protected:
  Given file = create();
};

std::string failed(const char* text) {
  return refused("CDFhyperPutzVarData", text);
}

std::string wrongNumber(const char* counts, long records, long expected) {
  return cdflib("wrongNumberOfHyperPutVarDataElements", counts, records, "v", expected);
}

TEST_F(WriteHyperslabsTest, ScalarRecordsAreWrittenInOneGo) {
  const double variable = createVar(file, {.datatype = 22});
  EXPECT_EQ(does("hyperPutVarData", {file, variable, 0, 3, 1, {}, {}, {}, {1, 2, 3}}), "done");
  EXPECT_EQ(does("hyperPutVarData", {file, variable, 1, 2, 3, {}, {}, {}, {8, 9}}), "done");
  EXPECT_EQ(does("hyperGetVarData", {file, variable, 0, 5, 1, {}, {}, {}}).substr(0, 18),
            "double 5x1 [1 8 3 ");
  EXPECT_EQ(does("getVarData", {file, variable, 4}), "double 1x1 [9]");
}

TEST_F(WriteHyperslabsTest, ABlockIsGivenInTheHostsOrderInBothMajorities) {
  for (const Given& target : {file, createColumnMajor("columns")}) {
    const double variable = createVar(target, {.sizes = {2, 3}});
    results("putVarRecordData", {target, variable, 0, row<std::int32_t>({0, 0, 0, 0, 0, 0})});
    EXPECT_EQ(does("hyperPutVarData",
                   {target, variable, 0, 1, 1, {1, 0}, {1, 2}, {1, 2}, row<std::int32_t>({7, 8})}),
              "done");
    EXPECT_EQ(does("getVarRecordData", {target, variable, 0}), "int32 2x3 [0 7 0 0 0 8]");
    results("close", {target});
  }
  const std::string expected = bytesOf<std::int32_t>({0, 7, 0, 0, 0, 8});
  EXPECT_THAT(fileBytes("new.cdf"), testing::HasSubstr(expected));
  EXPECT_THAT(fileBytes("columns.cdf"), testing::HasSubstr(expected));
}

// The library would compute the last record and index in 32 bits and write beyond the variable.
TEST_F(WriteHyperslabsTest, RecordsAndIndicesThatWrapAroundAreOutOfRange) {
  const double row5 = createVar(file, {.sizes = {5}, .name = "row"});
  EXPECT_EQ(does("hyperPutVarData",
                 {file, row5, 0, 1, 1, {0}, {3}, {2147483647}, row<std::int32_t>({1, 2, 3})}),
            failed(kBadDimIndex));
  for (const int sparse : {0, 1}) {
    const double scalar = createVar(file, {.name = sparse == 0 ? "dense" : "sparse"});
    results("setVarSparseRecords", {file, scalar, sparse});
    EXPECT_EQ(does("hyperPutVarData",
                   {file, scalar, 1, 2, 2147483647, {}, {}, {}, row<std::int32_t>({1, 2})}),
              failed(kBadRecNum));
  }
  results("close", {file});
  open("new.cdf");
}

TEST_F(WriteHyperslabsTest, TheWrongNumberIsReportedWithTheCountsInTheLibrarysOrder) {
  const Given columns = createColumnMajor("columns");
  for (const auto& [target, counts] :
       {std::pair<Given, const char*>{columns, "[ 2 3 ]"}, {file, "[ 3 2 ]"}}) {
    const double variable = createVar(target, {.datatype = 22, .sizes = {2, 3}});
    EXPECT_EQ(does("hyperPutVarData", {target,
                                       variable,
                                       0,
                                       2,
                                       1,
                                       {0, 0},
                                       {2, 3},
                                       {1, 1},
                                       Array::zeros(ClassId::kDouble, {10, 1})}),
              wrongNumber(counts, 2, 12));
  }
}

TEST_F(WriteHyperslabsTest, NegativeCountsAreReportedAsTheyAre) {
  createVar(file, {.datatype = 22, .sizes = {2}});
  EXPECT_EQ(does("hyperPutVarData", {file, 0, 0, -1, 1, 0, 2, 1, {1, 2}}),
            wrongNumber("[ 2 ]", -1, -2));
  EXPECT_EQ(does("hyperPutVarData", {file, 0, 0, 1, 1, 0, -2, 1, {1, 2}}),
            wrongNumber("[ -2 ]", 1, -2));
}

// Only the library compares the vectors with the dimensions.
TEST_F(WriteHyperslabsTest, VectorsShorterThanTheDimensionsAreFilledWithZeros) {
  createVar(file, {.datatype = 22, .sizes = {2, 2}});
  const Given zeros = {0, 0}, ones = {1, 1};
  EXPECT_EQ(does("hyperPutVarData", {file, 0, 0, 1, 1, zeros, 1, ones, 5}), failed(kBadDimCount));
  EXPECT_EQ(does("hyperPutVarData", {file, 0, 0, 1, 1, zeros, ones, 1, 5}),
            failed(kBadDimInterval));
  EXPECT_EQ(does("hyperPutVarData", {file, 0, 0, 1, 1, zeros, {}, {}, 5}), failed(kBadDimCount));
  EXPECT_EQ(does("hyperPutVarData", {file, 0, 0, 1, 1, {}, ones, ones, 5}), "done");
  EXPECT_EQ(does("getVarData", {file, 0, 0, {0, 0}}), "double 1x1 [5]");
}

TEST_F(WriteHyperslabsTest, CountsBeyondTheDimensionsNeverLetTheLibraryReadBeyondTheData) {
  createVar(file, {.datatype = 22});
  EXPECT_EQ(does("hyperPutVarData", {file, 0, 0, 1, 1, {}, 0, {}, {}}), failed(kBadDimCount));
  EXPECT_EQ(does("hyperPutVarData", {file, 0, 0, 1, 1, {0}, {1}, {1}, 6}), "done");
  EXPECT_EQ(does("getVarData", {file, 0, 0}), "double 1x1 [6]");
  EXPECT_EQ(does("hyperPutVarData", {file, 0, 0, 1, 1, {}, {2}, {}, {1, 2}}), "done");
}

TEST_F(WriteHyperslabsTest, MoreThanTenNumbersAreNoHarm) {
  createVar(file, {.datatype = 22, .sizes = {1}});
  const Given many = Array::of<double>(std::vector<double>(12, 1.0), {1, 12});
  const Given zeros = Array::zeros(ClassId::kDouble, {1, 12});
  EXPECT_EQ(does("hyperPutVarData", {file, 0, 0, 1, 1, zeros, many, many, 3}), "done");
  EXPECT_EQ(does("getVarData", {file, 0, 0, 0}), "double 1x1 [3]");
}

TEST_F(WriteHyperslabsTest, NumbersOutOfRangeAreTheLibrarysFailure) {
  createVar(file, {.datatype = 22, .sizes = {2}});
  const double cut = 4294967296.0;
  const auto writes = [&](Given record, Given stride, Given start, Given count, Given interval) {
    const std::size_t values = static_cast<std::size_t>(count.view().data<double>()[0]);
    return does("hyperPutVarData", {file, 0, record, 1, stride, start, count, interval,
                                    Array::zeros(ClassId::kDouble, {1, values})});
  };
  EXPECT_EQ(writes(-1, 1, 0, 1, 1), failed(kBadRecNum));
  EXPECT_EQ(writes(cut, 1, 0, 1, 1), failed(kBadRecNum));
  EXPECT_EQ(writes(0, 0, 0, 1, 1), failed(kBadRecInterval));
  EXPECT_EQ(writes(0, cut + 1, 0, 1, 1), failed(kBadRecInterval));
  EXPECT_EQ(writes(0, 1, 2, 1, 1), failed(kBadDimIndex));
  EXPECT_EQ(writes(0, 1, cut, 1, 1), failed(kBadDimIndex));
  EXPECT_EQ(writes(0, 1, 0, 3, 1), failed(kBadDimIndex));
  EXPECT_EQ(writes(0, 1, 0, 0, 1), failed(kBadDimCount));
  EXPECT_EQ(writes(0, 1, 0, 1, 0), failed(kBadDimInterval));
  EXPECT_EQ(writes(0, 1, 0, 1, cut + 1), failed(kBadDimInterval));
  EXPECT_EQ(does("hyperPutVarData", {file, 9, 0, 1, 1, 0, 1, 1, 1}),
            refused("CDFinquirezVar", kNoSuchVar));
}

TEST_F(WriteHyperslabsTest, AlongADimensionThatDoesNotVaryTheLastValueStays) {
  createVar(file, {.datatype = 22, .sizes = {3}, .variances = {0}});
  EXPECT_EQ(does("hyperPutVarData", {file, 0, 0, 1, 1, 0, 3, 1, {1, 2, 3}}), "done");
  EXPECT_EQ(does("hyperGetVarData", {file, 0, 0, 1, 1, 0, 3, 1}), "double 3x1 [3 3 3]");
}

}  // namespace
}  // namespace ambrix_test
