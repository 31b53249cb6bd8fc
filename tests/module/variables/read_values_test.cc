// "getVarData": one value.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using ReadValuesTest = ModuleTest;
const std::string kCannotOmit = "TOLVEX:ambrix:cdflib:cannotOmitDimSpec()";

std::string readingValueFailed(const char* text) {
  return refused("CDFgetzVarData", text);
}

TEST_F(ReadValuesTest, AScalarVariableNeedsNoIndices) {
  const Given example = open(distributionSample("example2.cdf"));
  EXPECT_EQ(does("getVarData", {example, 0, 23}), "int32 1x1 [2300]");
  EXPECT_EQ(does("getVarData", {example, 0, 1, {}}), "int32 1x1 [100]");
  const Given epochs = open(distributionSample("cacsst2.cdf"));
  EXPECT_EQ(result("getVarData", {epochs, 3, 0}).classId(), ClassId::kDouble);
}

// Of sizes (10, 20) to the library, with value 20 r + c + 200 record.
TEST_F(ReadValuesTest, IndicesOfARowMajorFileAreReversed) {
  const Given example = open(distributionSample("example1.cdf"));
  EXPECT_EQ(does("getVarData", {example, 2, 0, {0, 0}}), "int32 1x1 [0]");
  EXPECT_EQ(does("getVarData", {example, 2, 0, {19, 9}}), "int32 1x1 [199]");
  EXPECT_EQ(does("getVarData", {example, 2, 0, {3, 2}}), "int32 1x1 [43]");
  EXPECT_EQ(does("getVarData", {example, 2, 2, {3, 2}}), "int32 1x1 [443]");
  EXPECT_EQ(does("getVarData", {example, 2, 0, {9, 10}}), readingValueFailed(kBadDimIndex));
}

TEST_F(ReadValuesTest, IndicesOfAColumnMajorFileAreAsGiven) {
  const Given columns = open(distributionSample("cacsst2.cdf"));
  EXPECT_EQ(does("getVarData", {columns, 2, 0, {179, 90}}), "single 1x1 [-1.79999995]");
  EXPECT_EQ(does("getVarData", {columns, 2, 0, {90, 179}}), readingValueFailed(kBadDimIndex));
}

TEST_F(ReadValuesTest, IndicesOfOtherClassesAreConverted) {
  const Given example = open(distributionSample("example1.cdf"));
  EXPECT_EQ(does("getVarData", {example, 2, 0, row<std::uint8_t>({3, 2})}), "int32 1x1 [43]");
  EXPECT_EQ(does("getVarData", {example, 2, 0, {3.9, 2.1}}), "int32 1x1 [43]");
  EXPECT_EQ(does("getVarData", {example, 2, 0, Array::cell({1, 2})}),
            validate("argumentNotDoublePrecision", "INDICES"));
  EXPECT_EQ(does("getVarData", {example, 2, 0, {1, 1e30}}), kOutOfBounds);
}

TEST_F(ReadValuesTest, IndicesMayNotBeOmittedWhereThereAreDimensions) {
  const Given example = open(distributionSample("example1.cdf"));
  EXPECT_EQ(does("getVarData", {example, 2, 0}), kCannotOmit);
  EXPECT_EQ(does("getVarData", {example, 2, 99}), kCannotOmit);
}

TEST_F(ReadValuesTest, ThereMustBeOneIndexForEachDimension) {
  const Given example = open(distributionSample("example1.cdf"));
  const std::string error = cdflib("badDimSpec", 2L, "Image");
  EXPECT_EQ(does("getVarData", {example, 2, 0, {1}}), error);
  EXPECT_EQ(does("getVarData", {example, 2, 0, {1, 2, 3}}), error);
  EXPECT_EQ(does("getVarData", {example, 2, 0, {}}), error);
  EXPECT_EQ(does("getVarData", {example, 0, 0, {0}}), cdflib("badDimSpec", 0L, "Time"));
}

TEST_F(ReadValuesTest, NumbersOutOfRangeAreTheLibrarysFailure) {
  const Given example = open(distributionSample("example1.cdf"));
  EXPECT_EQ(does("getVarData", {example, 0, -1}), readingValueFailed(kBadRecNum));
  EXPECT_EQ(does("getVarData", {example, 0, 4294967296.0}), readingValueFailed(kBadRecNum));
  EXPECT_EQ(does("getVarData", {example, 2, 0, {-1, 0}}), readingValueFailed(kBadDimIndex));
  EXPECT_EQ(does("getVarData", {example, 2, 0, {4294967296.0, 0}}),
            readingValueFailed(kBadDimIndex));
  EXPECT_EQ(does("getVarData", {example, 3, 0}), refused("CDFinquirezVar", kNoSuchVar));
  EXPECT_EQ(does("getVarData", {example, 4294967296.0, 0}), refused("CDFinquirezVar", kNoSuchVar));
  EXPECT_EQ(does("getVarData", {example, 0, 0}), "int32 1x1 [23]");
}

TEST_F(ReadValuesTest, ARecordBeyondTheLastReadsAsThePadValue) {
  const Given file = create();
  const double variable = createVar(file, {});
  results("setVarPadValue", {file, variable, row<std::int32_t>({-5})});
  EXPECT_EQ(does("getVarData", {file, variable, 7}), "int32 1x1 [-5]");
}

TEST_F(ReadValuesTest, AnEpoch16IsAColumnOfTwoDoubles) {
  AMBRIX_NEED_SAMPLE(path, "nasajava_test.cdf");
  const Given others = open(path);
  const double epoch = number("getVarNum", {others, "ep16"});
  EXPECT_EQ(does("getVarData", {others, epoch, 0}), "double 2x1 [63268962923 30411522634]");
}

TEST_F(ReadValuesTest, ATextIsAColumnOfItsCharacters) {
  AMBRIX_NEED_SAMPLE(path, "nasajava_test.cdf");
  const Given others = open(path);
  const double name = number("getVarNum", {others, "Name"});
  EXPECT_EQ(does("getVarData", {others, name, 0, 0}), "char 10x1 '123456789 '");
  EXPECT_EQ(does("getVarData", {others, name, 0, 1}), "char 10x1 '13579     '");
  EXPECT_EQ(does("getVarData", {others, name, 1, 1}), "char 10x1 'bcdefghij '");
}

TEST_F(ReadValuesTest, UnsupportedDatatypesAreReportedAfterTheIndices) {
  AMBRIX_NEED_SAMPLE(path, "nasajava_test.cdf");
  const Given others = open(path);
  const double int8 = number("getVarNum", {others, "newI8"});
  const double tt2000 = number("getVarNum", {others, "tt2000"});
  EXPECT_EQ(does("getVarData", {others, int8, 0, 0}), unrecognized(8, "DATATYPE"));
  EXPECT_EQ(does("getVarData", {others, tt2000, -1}), unrecognized(33, "DATATYPE"));
  EXPECT_EQ(does("getVarData", {others, int8, 0}), kCannotOmit);
  EXPECT_EQ(does("getVarData", {others, int8, 0, {}}), cdflib("badDimSpec", 1L, "newI8"));
}

}  // namespace
}  // namespace ambrix_test
