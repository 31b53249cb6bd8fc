// Records that do not vary and were never written are not read in files that the library would read
// wrongly.
#include "gateway/library_faults.h"
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;

class UnwrittenRecordTest : public ScriptedTest {
 protected:
  UnwrittenRecordTest() { TOLVEX::ambrix::libraryFaults().leavesUnwrittenRecords = true; }
  void describeUnwritten(const Variable& variable) {
    describe(variable);
    fake.answer("zVAR_MAXREC_", {-1});
    fake.answer("CDF_VERSION_", {2});
    fake.answerData(std::vector<std::int32_t>{9});
  }
};

const std::string kQuestion = "SELECT_ CDF_ 7 | zVAR_ 3 | GET_ zVAR_MAXREC_ | CDF_VERSION_";
const std::string kPadValue = "SELECT_ CDF_ 7 | zVAR_ 3 | GET_ zVAR_PADVALUE_";

TEST_F(UnwrittenRecordTest, ThePadValueFillsARecord) {
  describeUnwritten({.datatype = 4, .sizes = {2, 2}, .variances = {-1, 0}, .recordVariance = 0});
  EXPECT_EQ(shown(result("getVarRecordData", {file(), 3, 0})), "int32 2x2 [9 9 0 0]");
  EXPECT_THAT(calls(), ElementsAre(kInquiry, kMajority, kQuestion, kPadValue));
}

TEST_F(UnwrittenRecordTest, TheLibraryChecksIndicesAndHyperslabs) {
  describeUnwritten({.datatype = 4, .sizes = {3}, .recordVariance = 0});
  EXPECT_EQ(shown(result("getVarData", {file(), 3, 0, 2})), "int32 1x1 [9]");
  EXPECT_THAT(calls(),
              testing::Contains(HasSubstr("zVAR_ 3 | zVAR_RECNUMBER_ 0 | zVAR_DIMINDICES_ [2]")));
  EXPECT_EQ(shown(result("hyperGetVarData", {file(), 3, 0, 2, 1, 1, 2, 1})), "int32 2x2 [9 9 9 9]");
  EXPECT_THAT(calls(), testing::Contains(HasSubstr("| zVAR_DIMINTERVALS_ [1]")));
  EXPECT_EQ(errorOf("hyperGetVarData", {file(), 3, 0, 2, 1, 1, 2, 2}),
            libraryFailure("CDFhyperGetzVarData", -2005));
}

TEST_F(UnwrittenRecordTest, WrittenOnesAndThoseOfNewerFilesAreRead) {
  describeUnwritten({.datatype = 4, .recordVariance = 0});
  fake.answer("CDF_VERSION_", {3});
  result("getVarRecordData", {file(), 3, 0});
  EXPECT_THAT(calls().back(), HasSubstr("CDFgetVarRecordData"));
  fake.answer("CDF_VERSION_", {2});
  fake.answer("zVAR_MAXREC_", {0});
  result("getVarRecordData", {file(), 3, 0});
  EXPECT_THAT(calls().back(), HasSubstr("CDFgetVarRecordData"));
}

TEST_F(UnwrittenRecordTest, ALibraryWithoutTheFaultIsAskedNothingMore) {
  TOLVEX::ambrix::libraryFaults().leavesUnwrittenRecords = false;
  describeUnwritten({.datatype = 4, .recordVariance = 0});
  for (const auto& [command, arguments] : std::vector<std::pair<std::string, Arguments>>{
           {"getVarData", {file(), 3, 0}},
           {"getVarRecordData", {file(), 3, 0}},
           {"hyperGetVarData", {file(), 3, 0, 1, 1, {}, {}, {}}}}) {
    result(command, arguments);
    EXPECT_THAT(calls(), ElementsAre(kInquiry, kMajority, testing::_)) << command;
  }
}

TEST_F(UnwrittenRecordTest, WithoutAnAnswerTheLibraryReads) {
  describeUnwritten({.datatype = 4, .recordVariance = 0});
  fake.endWith(kQuestion, -2013);
  result("getVarRecordData", {file(), 3, 0});
  EXPECT_THAT(calls().back(), HasSubstr("CDFgetVarRecordData"));
}

TEST_F(UnwrittenRecordTest, NoValuesAreFilledIfNoneAreWanted) {
  describeUnwritten({.datatype = 4, .sizes = {3}, .recordVariance = 0});
  EXPECT_EQ(shown(result("hyperGetVarData", {file(), 3, 0, 1, 1, 1, 0, 1})), "int32 0x1 []");
  EXPECT_THAT(calls(), testing::Not(testing::Contains(kPadValue)));
}

TEST_F(UnwrittenRecordTest, ADefaultPadValueOfNumbersIsWhole) {
  describeUnwritten({.datatype = 22, .recordVariance = 0});
  fake.answerData(std::vector<double>{0.1});
  fake.endWith("GET_ zVAR_PADVALUE_", 1005);
  EXPECT_EQ(shown(result("getVarRecordData", {file(), 3, 0})), "double 1x1 [0.10000000000000001]");
}

TEST_F(UnwrittenRecordTest, OneCharacterStandsForAPadValueThatWasNeverSet) {
  describe({.datatype = 51, .elements = 3, .recordVariance = 0});
  fake.answer("zVAR_MAXREC_", {-1});
  fake.answer("CDF_VERSION_", {2});
  fake.answerData(std::vector<char>{'x', '-', '-'});
  EXPECT_EQ(shown(result("getVarRecordData", {file(), 3, 0})), "char 3x1 'x--'");
  fake.endWith("GET_ zVAR_PADVALUE_", 1005);
  EXPECT_EQ(shown(result("getVarRecordData", {file(), 3, 0})), "char 3x1 'xxx'");
}

}  // namespace
}  // namespace ambrix_test
