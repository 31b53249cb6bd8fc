// Inquiring, naming, closing and deleting variables.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using VariableDefinitionTest = ScriptedTest;

TEST_F(VariableDefinitionTest, InquireVarReturnsSixResults) {
  describe({.datatype = 4, .sizes = {2, 3, 4}, .variances = {-1, 0, 0}, .name = "B_gse"});
  EXPECT_THAT(shown(call("inquireVar", {file(), 3})),
              ElementsAre("char 1x5 'B_gse'", "char 1x8 'cdf_int4'", "double 1x1 [1]",
                          "double 1x3 [2 3 4]", "logical 1x1 [1]", "logical 1x3 [1 0 0]"));
  EXPECT_THAT(calls(), ElementsAre(kInquiry, kMajority));
}

TEST_F(VariableDefinitionTest, SizesAndVariancesOfARowMajorFileAreReversed) {
  describe({.sizes = {4, 3, 2}, .variances = {-1, -1, 0}, .majority = 1, .recordVariance = 0});
  const std::vector<Array> results = call("inquireVar", {file(), 3});
  EXPECT_EQ(shown(results[3]), "double 1x3 [2 3 4]");
  EXPECT_EQ(shown(results[4]), "logical 1x1 [0]");
  EXPECT_EQ(shown(results[5]), "logical 1x3 [0 1 1]");
}

TEST_F(VariableDefinitionTest, AMajorityThatIsNoneCountsAsThatOfColumns) {
  describe({.sizes = {4, 3, 2}, .majority = 3});
  EXPECT_EQ(shown(call("inquireVar", {file(), 3})[3]), "double 1x3 [4 3 2]");
}

TEST_F(VariableDefinitionTest, AScalarVariableHasEmptyArrays) {
  describe({.datatype = 51, .elements = 20, .name = std::string(256, 'n')});
  const std::vector<Array> results = call("inquireVar", {file(), 3});
  EXPECT_EQ(results[0].utf8(), std::string(256, 'n'));
  EXPECT_EQ(shown(results[2]), "double 1x1 [20]");
  EXPECT_EQ(shown(results[3]), "double 0x0 []");
  EXPECT_EQ(shown(results[5]), "logical 0x0 []");
}

TEST_F(VariableDefinitionTest, OddAnswersAreUnrecognized) {
  describe({.datatype = 33});
  EXPECT_EQ(errorOf("inquireVar", {file(), 3}), unrecognized(33, "DATATYPE"));
  describe({.recordVariance = 5});
  EXPECT_EQ(errorOf("inquireVar", {file(), 3}), unrecognized(5, "VARIANCE"));
  describe({.sizes = {2, 3}, .variances = {-1, 1}});
  EXPECT_EQ(errorOf("inquireVar", {file(), 3}), unrecognized(1, "VARIANCE"));
}

TEST_F(VariableDefinitionTest, AnImpossibleNumberOfDimensionsIsRefusedInTheLibrarysWords) {
  describe({});
  for (const long dimensions : {11L, -1L}) {
    fake.answer("zVAR_NUMDIMS_", {dimensions});
    EXPECT_EQ(errorOf("inquireVar", {file(), 3}), libraryFailure("CDFinquirezVar", -2008));
  }
}

TEST_F(VariableDefinitionTest, VariablesAreClosedDeletedRenamedAndNamed) {
  EXPECT_THAT(call("closeVar", {file(), 3}), IsEmpty());
  EXPECT_THAT(call("deleteVar", {file(), 3}), IsEmpty());
  EXPECT_THAT(call("renameVar", {file(), 3, "new name"}), IsEmpty());
  fake.answerText("zVAR_NAME_", "v");
  EXPECT_EQ(shown(result("getVarName", {file(), 3})), "char 1x1 'v'");
  EXPECT_THAT(calls(), ElementsAre("SELECT_ CDF_ 7 | zVAR_ 3 | CLOSE_ zVAR_",
                                   "SELECT_ CDF_ 7 | zVAR_ 3 | DELETE_ zVAR_",
                                   "SELECT_ CDF_ 7 | zVAR_ 3 | PUT_ zVAR_NAME_ 'new name'",
                                   "SELECT_ CDF_ 7 | zVAR_ 3 | GET_ zVAR_NAME_"));
}

TEST_F(VariableDefinitionTest, CloseVarLabelsTheVariableCdfid) {
  EXPECT_EQ(errorOf("closeVar", {file(), "x"}), notScalar("CDFID"));
}

TEST_F(VariableDefinitionTest, GetVarNumReturnsTheNumber) {
  fake.answer("CDFgetVarNum", {12});
  EXPECT_EQ(shown(result("getVarNum", {file(), "v"})), "double 1x1 [12]");
  EXPECT_THAT(calls(), ElementsAre("CDFgetVarNum 7 'v'"));
}

TEST_F(VariableDefinitionTest, AFailingGetVarNumNamesCdfclosezvar) {
  fake.answer("CDFgetVarNum", {-2012});
  EXPECT_EQ(errorOf("getVarNum", {file(), "no"}), libraryFailure("CDFclosezVar", -2012));
}

}  // namespace
}  // namespace ambrix_test
