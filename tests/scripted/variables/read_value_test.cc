// Reading one value.
#include "tests/support/datatypes.h"
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using ReadValueTest = ScriptedTest;

const std::string kRead = "SELECT_ CDF_ 7 | zVAR_ 3 | zVAR_RECNUMBER_ ";

TEST_F(ReadValueTest, AScalarVariableNeedsNoIndices) {
  describe({});
  fake.answerData(std::vector<double>{2.5});
  EXPECT_EQ(shown(result("getVarData", {file(), 3, 9})), "double 1x1 [2.5]");
  EXPECT_THAT(calls(), ElementsAre(kInquiry, kMajority,
                                   kRead + "9 | zVAR_DIMINDICES_ [] | GET_ zVAR_DATA_"));
  EXPECT_EQ(shown(result("getVarData", {file(), 3, 9, {}})), "double 1x1 [2.5]");
}

TEST_F(ReadValueTest, IndicesGoAsTheyAreForAColumnMajorFileAndReversedForARowMajorOne) {
  describe({.datatype = 4, .sizes = {5, 6}});
  fake.answerData(std::vector<std::int32_t>{-7});
  EXPECT_EQ(shown(result("getVarData", {file(), 3, 0, {1, 2}})), "int32 1x1 [-7]");
  EXPECT_EQ(calls()[2], kRead + "0 | zVAR_DIMINDICES_ [1 2] | GET_ zVAR_DATA_");
  fake.answer("CDF_MAJORITY_", {1});
  result("getVarData", {file(), 3, -1, {1, 2}});
  EXPECT_EQ(calls()[2], kRead + "-1 | zVAR_DIMINDICES_ [2 1] | GET_ zVAR_DATA_");
}

TEST_F(ReadValueTest, AnEpoch16IsAColumnOfTwo) {
  describe({.datatype = 32});
  fake.answerData(std::vector<double>{1, 2});
  EXPECT_EQ(shown(result("getVarData", {file(), 3, 0})), "double 2x1 [1 2]");
}

TEST_F(ReadValueTest, ATextIsAColumnWithSignWidenedCharacters) {
  describe({.datatype = 51, .elements = 5, .sizes = {2, 3}});
  std::vector<char> answer(30, 'z');  // more room than one value needs
  std::ranges::copy(std::string("ab\xE9\x80\x7F"), answer.begin());
  fake.answerData(answer);
  EXPECT_EQ(shown(result("getVarData", {file(), 3, 0, {0, 0}})),
            "char 5x1 'ab\\xFFE9\\xFF80\\x7F'");
}

TEST_F(ReadValueTest, EveryDatatypeComesInItsClass) {
  for (const CdfDatatype& datatype : kCdfDatatypes) {
    describe({.datatype = datatype.code});
    fake.answerData(std::vector<char>(datatype.bytes, 1));
    EXPECT_STREQ(result("getVarData", {file(), 3, 0}).className(), datatype.className);
  }
}

TEST_F(ReadValueTest, IndicesMayBeOmittedOnlyWithoutDimensions) {
  describe({.sizes = {5}});
  EXPECT_EQ(errorOf("getVarData", {file(), 3, 0}), cdflib("cannotOmitDimSpec"));
  EXPECT_THAT(calls(), ElementsAre(kInquiry));
}

TEST_F(ReadValueTest, ThereIsOneIndexForEachDimension) {
  describe({.sizes = {5, 6}, .name = "B"});
  EXPECT_EQ(errorOf("getVarData", {file(), 3, 0, {1}}), cdflib("badDimSpec", 2, "B"));
  EXPECT_EQ(errorOf("getVarData", {file(), 3, 0, {1, 2, 3}}), cdflib("badDimSpec", 2, "B"));
  EXPECT_EQ(errorOf("getVarData", {file(), 3, 0, {}}), cdflib("badDimSpec", 2, "B"));
  EXPECT_THAT(calls(), ElementsAre(kInquiry, kInquiry, kInquiry));
}

TEST_F(ReadValueTest, AnUnsupportedDatatypeComesAfterTheIndices) {
  describe({.datatype = 33, .sizes = {5}, .name = "B"});
  EXPECT_EQ(errorOf("getVarData", {file(), 3, 0, {1, 2}}), cdflib("badDimSpec", 1, "B"));
  EXPECT_EQ(errorOf("getVarData", {file(), 3, 0, {1}}), unrecognized(33, "DATATYPE"));
  describe({.datatype = 8});
  EXPECT_EQ(errorOf("getVarData", {file(), 3, 0}), unrecognized(8, "DATATYPE"));
}

TEST_F(ReadValueTest, ADamagedDescriptionIsRefusedInTheLibrarysWords) {
  describe({.datatype = 4, .elements = 1000});
  EXPECT_EQ(errorOf("getVarData", {file(), 3, 0}), libraryFailure("CDFgetzVarData", -2011));
  describe({.datatype = 51, .elements = 0});
  EXPECT_EQ(errorOf("getVarData", {file(), 3, 0}), libraryFailure("CDFgetzVarData", -2011));
  describe({.datatype = 4, .sizes = {65536, 65536}});
  EXPECT_EQ(errorOf("getVarData", {file(), 3, 0, {0, 0}}), libraryFailure("CDFgetzVarData", -2004));
}

TEST_F(ReadValueTest, ARecordOfAsManyBytesAsTheLibraryCanCountIsRead) {
  describe({.datatype = 1, .sizes = {2147483647}});
  EXPECT_EQ(errorOf("getVarData", {file(), 3, 0, 0}), "no error");
  describe({.datatype = 1, .sizes = {2147483647, 2}});
  EXPECT_EQ(errorOf("getVarData", {file(), 3, 0, {0, 0}}), libraryFailure("CDFgetzVarData", -2004));
}

TEST_F(ReadValueTest, DimensionsThatDoNotVaryAddNoBytesToARecord) {
  describe({.datatype = 4, .sizes = {65536, 65536}, .variances = {-1, 0}});
  EXPECT_EQ(errorOf("getVarData", {file(), 3, 0, {0, 0}}), "no error");
}

}  // namespace
}  // namespace ambrix_test
