// "getVarRecordData": one record in the host's shape.
#include <numeric>

#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using ReadRecordsTest = ModuleTest;

std::string readingRecordFailed(const char* text) {
  return refused("CDFgetzVarRecordData", text);
}

TEST_F(ReadRecordsTest, ARowMajorRecordHasItsFastestDimensionFirst) {
  const Given example = open(distributionSample("example1.cdf"));
  const Array image = result("getVarRecordData", {example, 2, 1});
  EXPECT_THAT(image.size(), testing::ElementsAre(20, 10));
  std::vector<std::int32_t> expected(200);
  std::iota(expected.begin(), expected.end(), 200);
  EXPECT_THAT(image.data<std::int32_t>(), testing::ElementsAreArray(expected));
}

TEST_F(ReadRecordsTest, AColumnMajorRecordHasItsSizesAsTheyAre) {
  const Given columns = open(distributionSample("cacsst2.cdf"));
  const Array latitudes = result("getVarRecordData", {columns, 0, 0});
  EXPECT_THAT(latitudes.size(), testing::ElementsAre(91, 1));
  EXPECT_EQ(latitudes.data<std::int16_t>()[90], 90);
  const Array temperatures = result("getVarRecordData", {columns, 2, 0});
  EXPECT_THAT(temperatures.size(), testing::ElementsAre(180, 91));
  EXPECT_FLOAT_EQ(temperatures.data<float>()[16379], -1.8F);
  EXPECT_EQ(temperatures.data<float>()[0], -1e9F);
}

TEST_F(ReadRecordsTest, BothMajoritiesOfOneContentAgreeWhereTheyMust) {
  AMBRIX_NEED_SAMPLE(rows, "nasajava_testCdfRowMajor.cdf");
  AMBRIX_NEED_SAMPLE(columns, "nasajava_testCdfColMajor.cdf");
  EXPECT_EQ(does("getVarRecordData", {open(rows), 0, 0}), "single 2x5 [1 0 0 1 0 0 0 0 0 2]");
  EXPECT_EQ(does("getVarRecordData", {open(columns), 0, 0}), "single 5x2 [1 0 0 0 0 0 1 0 0 2]");
}

TEST_F(ReadRecordsTest, AScalarRecordIsOneByOne) {
  EXPECT_EQ(does("getVarRecordData", {open(distributionSample("example1.cdf")), 0, 0}),
            "int32 1x1 [23]");
}

TEST_F(ReadRecordsTest, ThreeDimensionsAreReversedAsAWhole) {
  AMBRIX_NEED_SAMPLE(path, "nasajava_test.cdf");
  const Given others = open(path);
  const double volume = number("getVarNum", {others, "volume"});
  EXPECT_EQ(does("getVarRecordData", {others, volume, 0}),
            "int32 2x4x2 [10 20 40 50 7 8 9 10 90 95 96 97 98 99 80 85]");
}

TEST_F(ReadRecordsTest, TextsKeepTheirCharactersInTheFirstDimension) {
  AMBRIX_NEED_SAMPLE(path, "nasajava_test.cdf");
  const Given others = open(path);
  const double name = number("getVarNum", {others, "Name"});
  EXPECT_EQ(does("getVarRecordData", {others, name, 0}), "char 10x2 '123456789 13579     '");
}

struct Shape {
  long datatype;
  long elements;
  std::vector<double> sizes;
  std::vector<std::size_t> rowMajor;
  std::vector<std::size_t> columnMajor;
};

// Sizes as the host gives them; they come back the same in both majorities.
const Shape kShapes[] = {
    {4, 1, {}, {1, 1}, {1, 1}},
    {32, 1, {}, {2, 1}, {2, 1}},
    {51, 1, {}, {1, 1}, {1, 1}},
    {51, 10, {}, {10, 1}, {10, 1}},
    {2, 1, {3}, {3, 1}, {3, 1}},
    {32, 1, {3}, {2, 3}, {2, 3}},
    {51, 1, {3}, {3, 1}, {3, 1}},
    {52, 5, {3}, {5, 3}, {5, 3}},
    {2, 1, {4, 3}, {4, 3}, {4, 3}},
    {32, 1, {4, 3}, {2, 4, 3}, {2, 4, 3}},
    {51, 1, {4, 3}, {4, 3}, {4, 3}},
    {51, 5, {4, 3}, {5, 4, 3}, {5, 4, 3}},
    {22, 1, {2, 3, 4}, {2, 3, 4}, {2, 3, 4}},
    {32, 1, {2, 3, 4}, {2, 2, 3, 4}, {2, 2, 3, 4}},
    {52, 2, {3, 4, 5}, {2, 3, 4, 5}, {2, 3, 4, 5}},
    {1, 1, {1, 2, 1}, {1, 2}, {1, 2}},
};

TEST_F(ReadRecordsTest, EveryKindOfVariableHasItsShape) {
  for (const bool rowMajor : {true, false}) {
    const Given file = rowMajor ? create("row") : createColumnMajor("column");
    double variable = 0;
    for (const Shape& shape : kShapes) {
      const std::string name = "v" + std::to_string(static_cast<int>(variable));
      createVar(file, {.datatype = shape.datatype,
                       .sizes = shape.sizes,
                       .elements = shape.elements,
                       .name = name.c_str()});
      const Array record = result("getVarRecordData", {file, variable, 0});
      EXPECT_THAT(record.size(),
                  testing::ElementsAreArray(rowMajor ? shape.rowMajor : shape.columnMajor))
          << name;
      ++variable;
    }
  }
}

TEST_F(ReadRecordsTest, DimensionsThatDoNotVaryReadAsZerosBehindWhatIsStored) {
  for (const bool rowMajor : {true, false}) {
    const Given file = rowMajor ? create("row") : createColumnMajor("column");
    const double variable = createVar(file, {.sizes = {3, 2}, .variances = {0, -1}});
    results("putVarRecordData", {file, variable, 0, row<std::int32_t>({1, 2, 3, 4, 5, 6})});
    EXPECT_EQ(does("getVarRecordData", {file, variable, 0}), "int32 3x2 [1 2 0 0 0 0]");
  }
}

TEST_F(ReadRecordsTest, TextsThatDoNotVaryReadAsZerosBehindWhatIsStored) {
  const Given file = create();
  const double variable =
      createVar(file, {.datatype = 51, .sizes = {3}, .elements = 2, .variances = {0}});
  results("putVarRecordData", {file, variable, 0, "abcdef"});
  EXPECT_EQ(does("getVarRecordData", {file, variable, 0}), "char 2x3 'ab\\x0\\x0\\x0\\x0'");
}

TEST_F(ReadRecordsTest, AVariableWithoutRecordVarianceHasOneRecordForAll) {
  const Given columns = open(distributionSample("cacsst2.cdf"));
  const std::string first = shown(result("getVarRecordData", {columns, 0, 0}));
  EXPECT_EQ(shown(result("getVarRecordData", {columns, 0, 5})), first);
}

TEST_F(ReadRecordsTest, ANegativeRecordIsRefusedAndTheFileStaysUsable) {
  const Given example = open(distributionSample("example1.cdf"));
  for (const double record : {-1.0, -5.0, 4294967296.0, 2147483648.0, 1e18}) {
    EXPECT_EQ(does("getVarRecordData", {example, 0, record}), readingRecordFailed(kBadRecNum))
        << record;
  }
  EXPECT_EQ(does("getVarRecordData", {example, 0, 0}), "int32 1x1 [23]");
}

TEST_F(ReadRecordsTest, OversizedRecordsAreRefusedBeforeTheLibraryDividesByThem) {
  const Given file = create();
  const double variable = createVar(file, {.datatype = 4, .sizes = {65536, 65536}});
  EXPECT_EQ(does("getVarRecordData", {file, variable, 0}), readingRecordFailed(kBadDimSize));
  EXPECT_EQ(does("getVarData", {file, variable, 0, {0, 0}}),
            refused("CDFgetzVarData", kBadDimSize));
  EXPECT_EQ(does("hyperGetVarData", {file, variable, 0, 1, 1, {0, 0}, {1, 1}, {1, 1}}),
            refused("CDFhyperGetzVarData", kBadDimSize));
  EXPECT_EQ(does("putVarData", {file, variable, 0, {0, 0}, row<std::int32_t>({1})}),
            refused("CDFputzVarData", kBadDimSize));
  EXPECT_EQ(does("hyperPutVarData",
                 {file, variable, 0, 1, 1, {0, 0}, {1, 1}, {1, 1}, row<std::int32_t>({1})}),
            refused("CDFhyperPutzVarData", kBadDimSize));
  EXPECT_EQ(does("getVarName", {file, variable}), "char 1x1 'v'");
}

TEST_F(ReadRecordsTest, UnsupportedDatatypesAreUnrecognized) {
  AMBRIX_NEED_SAMPLE(path, "nasajava_test.cdf");
  const Given others = open(path);
  const double int8 = number("getVarNum", {others, "newI8"});
  EXPECT_EQ(does("getVarRecordData", {others, int8, -1}), unrecognized(8, "DATATYPE"));
}

}  // namespace
}  // namespace ambrix_test
