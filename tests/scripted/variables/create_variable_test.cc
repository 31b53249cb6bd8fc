// Creating variables.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class CreateVariableTest : public ScriptedTest {
 protected:
  CreateVariableTest() {
    fake.answer("CDF_MAJORITY_", {2});
    fake.answer("zVAR_", {4});
  }
  std::string errorWith(const Given& recordVariance, const Given& variances) {
    return errorOf("createVar", {file(), "v", 4, 1, {2, 3}, recordVariance, variances});
  }
};

TEST_F(CreateVariableTest, SizesAndVariancesGoAsTheyAreToAColumnMajorFile) {
  EXPECT_EQ(shown(result("createVar", {file(), "v", 4, 1, {2, 3, 4}, -1, {-1, 0, 0}})),
            "double 1x1 [4]");
  EXPECT_THAT(calls(), ElementsAre(kMajority,
                                   "SELECT_ CDF_ 7 | CREATE_ zVAR_ 'v' 4 1 3 [2 3 4] -1 [-1 0 0]"));
}

TEST_F(CreateVariableTest, BothAreReversedForARowMajorFile) {
  fake.answer("CDF_MAJORITY_", {1});
  call("createVar", {file(), "v", 4, 1, {2, 3, 4}, 0, {0, 0, -1}});
  EXPECT_THAT(calls()[1], "SELECT_ CDF_ 7 | CREATE_ zVAR_ 'v' 4 1 3 [4 3 2] 0 [-1 0 0]");
}

TEST_F(CreateVariableTest, EmptyListsMakeAScalarVariable) {
  call("createVar", {file(), "v", 51, 8, {}, -1, {}});
  EXPECT_THAT(calls()[1], "SELECT_ CDF_ 7 | CREATE_ zVAR_ 'v' 51 8 0 [] -1 []");
}

TEST_F(CreateVariableTest, TheLibraryJudgesDatatypeElementsAndSizes) {
  call("createVar", {file(), "v", 99, -1, {0, -5}, -1, {-1, -1}});
  EXPECT_THAT(calls()[1], "SELECT_ CDF_ 7 | CREATE_ zVAR_ 'v' 99 -1 2 [0 -5] -1 [-1 -1]");
}

TEST_F(CreateVariableTest, MoreThanTenDimensionsReachTheLibraryAsTheirNumber) {
  const Given eleven = elements<double>(11);
  call("createVar", {file(), "v", 4, 1, eleven, -1, eleven});
  EXPECT_THAT(calls()[1], testing::HasSubstr("zVAR_ 'v' 4 1 11 ["));
}

TEST_F(CreateVariableTest, VariancesAreLogicalOrDouble) {
  call("createVar", {file(), "v", 4, 1, {2, 3}, row<bool>({true}), row<bool>({false, true})});
  EXPECT_THAT(calls()[1], "SELECT_ CDF_ 7 | CREATE_ zVAR_ 'v' 4 1 2 [2 3] -1 [0 -1]");
  call("createVar", {file(), "v", 4, 1, {2, 3}, -1.9, {0.7, -0.5}});
  EXPECT_THAT(calls()[1], "SELECT_ CDF_ 7 | CREATE_ zVAR_ 'v' 4 1 2 [2 3] -1 [0 0]");
  EXPECT_EQ(errorWith("x", {-1, -1}), cdflib("badVarianceDatatype"));
  EXPECT_EQ(errorWith(-1, row<float>({-1, -1})), cdflib("badVarianceDatatype"));
  EXPECT_EQ(errorWith(row<std::int32_t>({-1}), {-1, -1}), cdflib("badVarianceDatatype"));
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(CreateVariableTest, OtherVariancesAreUnrecognized) {
  EXPECT_EQ(errorWith(1, {-1, -1}), unrecognized(1, "VARIANCE"));
  EXPECT_EQ(errorWith(-1, {-1, 2}), unrecognized(2, "VARIANCE"));
  EXPECT_EQ(errorWith(-2, {-1, 2}), unrecognized(-2, "VARIANCE"));
  EXPECT_EQ(errorWith(1e30, {-1, -1}), validate("argumentOutOfBounds"));
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(CreateVariableTest, OnlyTheFirstRecordVarianceCounts) {
  call("createVar", {file(), "v", 4, 1, {2}, {0, -1, -1}, -1});
  EXPECT_THAT(calls()[1], "SELECT_ CDF_ 7 | CREATE_ zVAR_ 'v' 4 1 1 [2] 0 [-1]");
  EXPECT_EQ(errorWith({-1, 5}, {-1, -1}), unrecognized(5, "VARIANCE"));
}

TEST_F(CreateVariableTest, TheNumberOfVariancesComesBeforeTheNumberOfDimensions) {
  EXPECT_EQ(errorWith(-1, {-1, -1, -1}), cdflib("mismatchedVarianceSize", 3, 2));
  EXPECT_EQ(errorWith(-1, {}), cdflib("mismatchedVarianceSize", 0, 2));
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(CreateVariableTest, AnEmptyRecordVarianceIsAMismatchAfterTheDimensionVariances) {
  EXPECT_EQ(errorWith({}, {-1, -1}), cdflib("mismatchedVarianceSize", 0, 1));
  EXPECT_EQ(errorWith({}, {-1}), cdflib("mismatchedVarianceSize", 1, 2));
}

}  // namespace
}  // namespace ambrix_test
