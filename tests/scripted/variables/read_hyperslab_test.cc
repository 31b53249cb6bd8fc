// Reading a hyperslab.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::HasSubstr;

class ReadHyperslabTest : public ScriptedTest {
 protected:
  std::string errorWith(const Given& start, const Given& count, const Given& interval) {
    return errorOf("hyperGetVarData", {file(), 3, 0, 1, 1, start, count, interval});
  }
};

TEST_F(ReadHyperslabTest, VectorsAreReversedForARowMajorFile) {
  describe({.sizes = {2, 3}, .majority = 1});
  const Array read = result("hyperGetVarData", {file(), 3, 5, 4, 2, {1, 0}, {2, 1}, {1, 2}});
  EXPECT_THAT(read.size(), ElementsAre(2, 1, 4));
  EXPECT_EQ(read.className(), std::string("double"));
  EXPECT_THAT(
      calls(),
      ElementsAre(kInquiry, kMajority,
                  kOnVariable + "zVAR_RECNUMBER_ 5 | zVAR_RECCOUNT_ 4 | zVAR_RECINTERVAL_ 2 | "
                                "zVAR_DIMINDICES_ [0 1] | zVAR_DIMCOUNTS_ [1 2] | "
                                "zVAR_DIMINTERVALS_ [2 1] | GET_ zVAR_HYPERDATA_"));
}

TEST_F(ReadHyperslabTest, AndPassAsTheyAreForAColumnMajorOne) {
  describe({.datatype = 2, .sizes = {2, 3}});
  fake.answerData(std::vector<std::int16_t>{1, 2, 3, 4});
  EXPECT_EQ(shown(result("hyperGetVarData", {file(), 3, 0, 2, 1, {0, 1}, {1, 2}, {1, 1}})),
            "int16 1x2x2 [1 2 3 4]");
  EXPECT_EQ(calls()[2],
            kOnVariable +
                "zVAR_RECNUMBER_ 0 | zVAR_RECCOUNT_ 2 | zVAR_RECINTERVAL_ 1 | zVAR_DIMINDICES_ "
                "[0 1] | zVAR_DIMCOUNTS_ [1 2] | zVAR_DIMINTERVALS_ [1 1] | GET_ zVAR_HYPERDATA_");
}

TEST_F(ReadHyperslabTest, CountsAreComparedWithTheDimensionsInTheLibrarysOrder) {
  describe({.sizes = {2, 3}, .majority = 1});
  EXPECT_EQ(errorWith({0, 0}, {3, 2}, {1, 1}), "no error");
  EXPECT_EQ(errorWith({0, 0}, {2, 3}, {1, 1}), cdflib("dimSizeTooLarge"));
  describe({.sizes = {2, 3}, .majority = 2});
  EXPECT_EQ(errorWith({0, 0}, {2, 3}, {1, 1}), "no error");
  EXPECT_EQ(errorWith({0, 0}, {3, 2}, {1, 1}), cdflib("dimSizeTooLarge"));
}

TEST_F(ReadHyperslabTest, StartsAndIntervalsAreLeftToTheLibrary) {
  describe({.sizes = {2, 3}});
  EXPECT_EQ(errorWith({-9, 100}, {1, 1}, {0, -5}), "no error");
}

// In 32 bits 0 + 2 * 2147483647 is -2, which the library would take for an index.
TEST_F(ReadHyperslabTest, AnIndexThatWrapsAroundBecomesOneBeyondTheDimension) {
  describe({.sizes = {2, 5}});
  EXPECT_EQ(errorWith({1, 0}, {1, 3}, {1, 2147483647}), "no error");
  EXPECT_THAT(calls().back(), HasSubstr("zVAR_DIMINDICES_ [1 5] | zVAR_DIMCOUNTS_ [1 3] | "
                                        "zVAR_DIMINTERVALS_ [1 1] | "));
  EXPECT_EQ(errorWith({1, 1}, {1, 2}, {1, 2147483646}), "no error");
  EXPECT_THAT(calls().back(), HasSubstr("zVAR_DIMINDICES_ [1 1] | zVAR_DIMCOUNTS_ [1 2] | "
                                        "zVAR_DIMINTERVALS_ [1 2147483646] | "));
}

TEST_F(ReadHyperslabTest, ARecordThatWrapsAroundBecomesOneThatTheLibraryRefuses) {
  describe({.sizes = {}});
  EXPECT_EQ(errorOf("hyperGetVarData", {file(), 3, 2147483647, 2, 1, {}, {}, {}}), "no error");
  EXPECT_THAT(calls().back(), HasSubstr("zVAR_RECNUMBER_ -1 | zVAR_RECCOUNT_ 2 | "));
  EXPECT_EQ(errorOf("hyperGetVarData", {file(), 3, 2147483645, 2, 1, {}, {}, {}}), "no error");
  EXPECT_THAT(calls().back(), HasSubstr("zVAR_RECNUMBER_ 2147483645 | zVAR_RECCOUNT_ 2 | "));
}

TEST_F(ReadHyperslabTest, LeadingDimensionsStayInFront) {
  describe({.datatype = 32, .sizes = {2, 3}, .majority = 1});
  EXPECT_THAT(result("hyperGetVarData", {file(), 3, 0, 4, 1, {0, 0}, {3, 1}, {1, 1}}).size(),
              ElementsAre(2, 3, 1, 4));
  describe({.datatype = 51, .elements = 2, .sizes = {2}});
  fake.answerData(std::vector<char>{'a', 'b', 'c', 'd', 'e', 'f', 'g', 'h'});
  EXPECT_EQ(shown(result("hyperGetVarData", {file(), 3, 0, 2, 1, {0}, {2}, {1}})),
            "char 2x2x2 'abcdefgh'");
  describe({.datatype = 51, .elements = 3});
  fake.answerData(std::vector<char>{'a', 'b', 'c', 'd', 'e', 'f'});
  EXPECT_EQ(shown(result("hyperGetVarData", {file(), 3, 0, 2, 1, {}, {}, {}})),
            "char 3x2 'abcdef'");
}

TEST_F(ReadHyperslabTest, TheFirstVectorOfAWrongLengthIsReportedWithTheDimensions) {
  describe({.sizes = {2, 3}, .name = "B"});
  const std::string error = cdflib("badDimSpec", 2, "B");
  EXPECT_EQ(errorWith({0}, {1, 1}, {1, 1}), error);
  EXPECT_EQ(errorWith({0, 0}, {1, 1, 1}, {1, 1}), error);
  EXPECT_EQ(errorWith({0, 0}, {1, 1}, {}), error);
  EXPECT_THAT(calls(), ElementsAre(kInquiry, kInquiry, kInquiry));
}

TEST_F(ReadHyperslabTest, LengthsComeBeforeCountsAndCountsBeforeTheDatatype) {
  describe({.datatype = 33, .sizes = {2}, .name = "B"});
  EXPECT_EQ(errorWith({0}, {9}, {1, 1}), cdflib("badDimSpec", 1, "B"));
  EXPECT_EQ(errorWith({0}, {9}, {1}), cdflib("dimSizeTooLarge"));
  EXPECT_EQ(errorWith({0}, {2}, {1}), unrecognized(33, "DATATYPE"));
}

TEST_F(ReadHyperslabTest, ANegativeCountIsTheHostsErrorAfterAllChecks) {
  describe({.datatype = 33, .sizes = {2}});
  EXPECT_EQ(errorWith({0}, {-1}, {1}), unrecognized(33, "DATATYPE"));
  describe({.sizes = {2}});
  EXPECT_THAT(errorWith({0}, {-1}, {1}), testing::StartsWith("TOLVEX:host:badDimension"));
  EXPECT_THAT(errorOf("hyperGetVarData", {file(), 3, 0, -1, 1, {0}, {1}, {1}}),
              testing::StartsWith("TOLVEX:host:badDimension"));
  describe({.datatype = 51, .elements = 4});
  EXPECT_THAT(errorOf("hyperGetVarData", {file(), 3, 0, -1, 1, {}, {}, {}}),
              testing::StartsWith("TOLVEX:host:badDimension"));
}

TEST_F(ReadHyperslabTest, ADamagedDescriptionIsRefusedInTheLibrarysWords) {
  describe({.datatype = 4, .elements = 1000});
  EXPECT_EQ(errorOf("hyperGetVarData", {file(), 3, 0, 1, 1, {}, {}, {}}),
            libraryFailure("CDFhyperGetzVarData", -2011));
  describe({.datatype = 4, .sizes = {65536, 65536}});
  EXPECT_EQ(errorWith({0, 0}, {1, 1}, {1, 1}), libraryFailure("CDFhyperGetzVarData", -2004));
}

// The library would write those between them, too, past the end of the result.
TEST_F(ReadHyperslabTest, NoneAreSkippedOfRecordsThatDoNotVary) {
  const auto intervalFor = [this](int records, const Given& counts) {
    result("hyperGetVarData", {file(), 3, 0, records, 2, {0, 0}, counts, {1, 1}});
    return calls().back();
  };
  describe({.sizes = {2, 3}, .variances = {-1, 0}, .recordVariance = 0});
  EXPECT_THAT(intervalFor(2, {2, 1}), HasSubstr("zVAR_RECCOUNT_ 2 | zVAR_RECINTERVAL_ 1 |"));
  EXPECT_THAT(intervalFor(3, {2, 1}), HasSubstr("zVAR_RECCOUNT_ 3 | zVAR_RECINTERVAL_ 1 |"));
  EXPECT_THAT(intervalFor(1, {2, 1}), HasSubstr("zVAR_RECINTERVAL_ 2 |"));
  describe({.sizes = {2, 3}, .variances = {-1, 0}, .recordVariance = -1});
  EXPECT_THAT(intervalFor(3, {2, 1}), HasSubstr("zVAR_RECINTERVAL_ 2 |"));
}

TEST_F(ReadHyperslabTest, ButOfPartsOfThemTheLibraryWritesOnlyWhatIsWanted) {
  describe({.sizes = {2, 3}, .variances = {-1, 0}, .recordVariance = 0});
  for (const Given& counts : {Given{1, 1}, Given{2, 2}}) {
    result("hyperGetVarData", {file(), 3, 0, 3, 2, {0, 0}, counts, {1, 1}});
    EXPECT_THAT(calls().back(), HasSubstr("zVAR_RECINTERVAL_ 2 |"));
  }
}

TEST_F(ReadHyperslabTest, TheIntervalLabelEndsInASmallE) {
  EXPECT_EQ(errorWith({}, {}, Array::cell({1, 1})),
            validate("argumentNotDoublePrecision", "DIMSTRIDe"));
}

}  // namespace
}  // namespace ambrix_test
