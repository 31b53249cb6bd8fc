// Writing a hyperslab: vectors of any length, the library judges them.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;

class WriteHyperslabTest : public ScriptedTest {
 protected:
  std::string errorWith(const Given& count, double records, const Given& data) {
    return errorOf("hyperPutVarData", {file(), 3, 0, records, 1, {}, count, {}, data});
  }
};

TEST_F(WriteHyperslabTest, VectorsAreReversedForARowMajorFile) {
  describe({.datatype = 2, .sizes = {2, 3}, .majority = 1});
  fake.readBytes(4);
  EXPECT_THAT(call("hyperPutVarData",
                   {file(), 3, 5, 1, 2, {1, 0}, {2, 1}, {1, 2}, row<std::int16_t>({1, 2})}),
              testing::IsEmpty());
  EXPECT_THAT(fake.bytesRead(), ElementsAre(1, 0, 2, 0));
  EXPECT_THAT(
      calls(),
      ElementsAre(kInquiry, kMajority,
                  kOnVariable + "zVAR_RECNUMBER_ 5 | zVAR_RECCOUNT_ 1 | zVAR_RECINTERVAL_ 2 | "
                                "zVAR_DIMINDICES_ [0 1] | zVAR_DIMCOUNTS_ [1 2] | "
                                "zVAR_DIMINTERVALS_ [2 1] | PUT_ zVAR_HYPERDATA_"));
}

TEST_F(WriteHyperslabTest, AndPassAsTheyAreForAColumnMajorOne) {
  describe({.sizes = {2, 3}});
  call("hyperPutVarData", {file(), 3, 5, 1, 2, {1, 0}, {2, 1}, {1, 2}, {8, 9}});
  EXPECT_THAT(calls()[2], testing::HasSubstr("zVAR_DIMCOUNTS_ [2 1] "));
}

TEST_F(WriteHyperslabTest, AWrongNumberOfElementsTellsTheCountsInTheLibrarysOrder) {
  const auto message = [](const char* counts, int records, int expected) {
    return cdflib("wrongNumberOfHyperPutVarDataElements", counts, records, "B", expected);
  };
  describe({.sizes = {2, 3}, .majority = 2, .name = "B"});
  EXPECT_EQ(errorWith({2, 3}, 2, elements<double>(10)), message("[ 2 3 ]", 2, 12));
  fake.answer("CDF_MAJORITY_", {1});
  EXPECT_EQ(errorWith({2, 3}, 2, elements<double>(10)), message("[ 3 2 ]", 2, 12));
  describe({.name = "B"});
  EXPECT_EQ(errorWith({}, 4, elements<double>(3)), message("[ ]", 4, 4));
}

TEST_F(WriteHyperslabTest, ElementsOfEveryDatatypeCount) {
  const auto message = [](int expected) {
    return cdflib("wrongNumberOfHyperPutVarDataElements", "[ 2 ]", 3, "B", expected);
  };
  describe({.datatype = 32, .sizes = {2}, .name = "B"});
  EXPECT_EQ(errorWith({2}, 3, {}), message(12));
  describe({.datatype = 51, .elements = 4, .sizes = {2}, .name = "B"});
  EXPECT_EQ(errorWith({2}, 3, {}), message(24));
  describe({.datatype = 4, .elements = 5, .sizes = {2}, .name = "B"});
  EXPECT_EQ(errorWith({2}, 3, {}), message(30));
}

TEST_F(WriteHyperslabTest, CountsBeyondTheDimensionsGoToTheLibrary) {
  describe({.sizes = {2}});
  EXPECT_EQ(errorOf("hyperPutVarData", {file(), 3, 0, 1, 1, {0}, {5}, {1}, elements<double>(5)}),
            "no error");
  EXPECT_THAT(calls()[2], testing::HasSubstr("zVAR_DIMCOUNTS_ [5] "));
}

TEST_F(WriteHyperslabTest, ShortVectorsAreFilledWithZeros) {
  describe({.sizes = {2, 3}});
  EXPECT_EQ(errorOf("hyperPutVarData", {file(), 3, 0, 1, 1, {}, {2}, {1}, {8, 9}}), "no error");
  EXPECT_EQ(calls()[2],
            kOnVariable +
                "zVAR_RECNUMBER_ 0 | zVAR_RECCOUNT_ 1 | zVAR_RECINTERVAL_ 1 | zVAR_DIMINDICES_ "
                "[0 0] | zVAR_DIMCOUNTS_ [2 0] | zVAR_DIMINTERVALS_ [1 0] | PUT_ zVAR_HYPERDATA_");
}

TEST_F(WriteHyperslabTest, LongVectorsNeverLetTheLibraryReadBeyondTheData) {
  describe({});
  EXPECT_EQ(errorWith(0, 1, {}), libraryFailure("CDFhyperPutzVarData", -2039));
  describe({.sizes = {4}});
  EXPECT_EQ(errorWith({4, 0}, 1, {}), libraryFailure("CDFhyperPutzVarData", -2039));
  EXPECT_EQ(errorWith({4, -1}, -1, elements<double>(4)), "no error");
  EXPECT_FALSE(fake.sawNullData());
}

TEST_F(WriteHyperslabTest, NotEvenByOneByte) {
  describe({.datatype = 1});
  EXPECT_EQ(errorWith(0, 1, elements<std::int8_t>(0)),
            libraryFailure("CDFhyperPutzVarData", -2039));
}

TEST_F(WriteHyperslabTest, ANegativeStartIsLeftToTheLibraryWhereverTheHyperslabEnds) {
  describe({.datatype = 4, .sizes = {2, 2}});
  const Given starts{-5, 0}, counts{2147483647, 0}, intervals{2, 1};
  call("hyperPutVarData",
       {file(), 3, 0, 1, 1, starts, counts, intervals, elements<std::int32_t>(0)});
  EXPECT_THAT(calls().back(), testing::HasSubstr("zVAR_DIMINDICES_ [-5 0] | "));
}

TEST_F(WriteHyperslabTest, MoreThanTenCountsAreCutToWhatTheLibraryReads) {
  describe({.sizes = {2}});
  const Given ones{2, 1, 1, 1, 1, 1, 1, 1, 1, 1, 1, 1};
  EXPECT_EQ(errorOf("hyperPutVarData", {file(), 3, 0, 1, 1, ones, ones, ones, {8, 9}}), "no error");
}

TEST_F(WriteHyperslabTest, CharactersKeepTheirLowBitsWithAZeroBehindThem) {
  describe({.datatype = 52, .elements = 2});
  fake.readBytes(5);
  EXPECT_EQ(errorWith({}, 2, Array::text(u"a\u20AC\u00E9d")), "no error");
  EXPECT_THAT(fake.bytesRead(), ElementsAre('a', 0xAC, 0xE9, 'd', 0));
}

TEST_F(WriteHyperslabTest, TheOrderIsCountThenDatatypeThenClass) {
  describe({.datatype = 33, .name = "B"});
  EXPECT_EQ(errorWith({}, 1, "xy"),
            cdflib("wrongNumberOfHyperPutVarDataElements", "[ ]", 1, "B", 1));
  EXPECT_EQ(errorWith({}, 1, "x"), unrecognized(33, "DATATYPE"));
  describe({.datatype = 4});
  EXPECT_EQ(errorWith({}, 1, 1), cdflib("datatypeMismatch", "double", "CDF_INT4"));
}

TEST_F(WriteHyperslabTest, ADamagedDescriptionIsRefusedInTheLibrarysWords) {
  describe({.datatype = 4, .sizes = {65536, 65536}});
  EXPECT_EQ(errorWith({1, 1}, 1, row<std::int32_t>({1})),
            libraryFailure("CDFhyperPutzVarData", -2004));
}

TEST_F(WriteHyperslabTest, CountsThatTheLibraryRefusesAreLeftToIt) {
  describe({.datatype = 4, .sizes = {2}});
  EXPECT_EQ(
      errorOf("hyperPutVarData", {file(), 3, 0, -1, 1, {0}, {-2}, {1}, row<std::int32_t>({1, 2})}),
      "no error");
  EXPECT_THAT(calls().back(), testing::HasSubstr("zVAR_RECCOUNT_ -1 | "));
}

// Two counts below one would make a product above it: data that the library never reads.
TEST_F(WriteHyperslabTest, CountsThatTheLibraryRefusesNeedNoDataHoweverLargeTheirProduct) {
  describe({.datatype = 4, .sizes = {2, 2}});
  const Given counts{-2, -2, 0};
  EXPECT_EQ(errorOf("hyperPutVarData",
                    {file(), 3, 0, 1, 1, {0, 0, 0}, counts, {1, 1, 1}, elements<std::int32_t>(0)}),
            "no error");
  EXPECT_THAT(calls().back(), testing::HasSubstr("zVAR_DIMCOUNTS_ [-2 -2] | "));
}

TEST_F(WriteHyperslabTest, TheIntervalLabelIsAllCapitals) {
  EXPECT_EQ(errorOf("hyperPutVarData", {file(), 3, 0, 1, 1, {}, {}, Array::cell({1, 1}), "x"}),
            validate("argumentNotDoublePrecision", "DIMSTRIDE"));
}

}  // namespace
}  // namespace ambrix_test
