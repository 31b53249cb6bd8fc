// Pad values.
#include "tests/support/host_texts.h"
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class PadValuesTest : public ScriptedTest {
 protected:
  std::string errorWith(long datatype, long elements, const Given& value) {
    describe({.datatype = datatype, .elements = elements, .name = "B"});
    return errorOf("setVarPadValue", {file(), 3, value});
  }
};

TEST_F(PadValuesTest, ANumberIsOneByOneWhateverTheDimensions) {
  describe({.datatype = 2, .sizes = {3, 4}});
  fake.answerData(std::vector<std::int16_t>{-32767});
  EXPECT_EQ(shown(result("getVarPadValue", {file(), 3})), "int16 1x1 [-32767]");
  EXPECT_THAT(calls(), ElementsAre(kInquiry, kOnVariable + "GET_ zVAR_PADVALUE_"));
}

TEST_F(PadValuesTest, AnEpoch16IsAColumnOfTwo) {
  describe({.datatype = 32});
  fake.answerData(std::vector<double>{1, 2});
  EXPECT_EQ(shown(result("getVarPadValue", {file(), 3})), "double 2x1 [1 2]");
}

TEST_F(PadValuesTest, ATextIsAColumnWithSignWidenedCharacters) {
  for (const long datatype : {51L, 52L}) {
    describe({.datatype = datatype, .elements = 4});
    fake.answerData(std::vector<char>{'a', '\xE9', 'c', ' '});
    EXPECT_EQ(shown(result("getVarPadValue", {file(), 3})), "char 4x1 'a\\xFFE9c '");
  }
}

TEST_F(PadValuesTest, ATextOfAVariableWithDimensionsHasRoomForEveryValue) {
  describe({.datatype = 51, .elements = 2, .sizes = {3}});
  fake.answerData(std::vector<char>{'a', 'b', 'c', 'd', 'e', 'f'});
  EXPECT_EQ(shown(result("getVarPadValue", {file(), 3})), "char 2x1 'ab'");
}

TEST_F(PadValuesTest, AnUnsupportedDatatypeIsUnrecognized) {
  describe({.datatype = 33});
  EXPECT_EQ(errorOf("getVarPadValue", {file(), 3}), unrecognized(33, "DATATYPE"));
  EXPECT_EQ(errorOf("setVarPadValue", {file(), 3, 1}), unrecognized(33, "DATATYPE"));
  EXPECT_THAT(calls(), ElementsAre(kInquiry, kInquiry));
}

TEST_F(PadValuesTest, ADamagedVariableNeverOverrunsItsArray) {
  describe({.datatype = 4, .elements = 1000});
  EXPECT_EQ(errorOf("getVarPadValue", {file(), 3}), libraryFailure("CDFgetzVarPadValue", -2011));
  constexpr long kMany = 1000000;  // beyond any room that there may be by chance
  describe({.datatype = 51, .elements = kMany, .sizes = {0}});
  fake.answerData(std::vector<char>(kMany, 'a'));
  EXPECT_EQ(result("getVarPadValue", {file(), 3}).utf8(), std::string(kMany, 'a'));
}

TEST_F(PadValuesTest, WhatTheLibraryLeavesUnwrittenOfATextReadsAsZeros) {
  describe({.datatype = 51, .elements = 4, .sizes = {2}});
  fake.answerData(std::vector<char>{'a'});
  EXPECT_EQ(result("getVarPadValue", {file(), 3}).chars(), std::u16string(u"a\0\0\0", 4));
}

TEST_F(PadValuesTest, NumbersAreSetByteForByte) {
  describe({.datatype = 2});
  fake.readBytes(2);
  EXPECT_THAT(call("setVarPadValue", {file(), 3, row<std::int16_t>({0x0102})}), IsEmpty());
  EXPECT_THAT(fake.bytesRead(), ElementsAre(2, 1));
  EXPECT_THAT(calls(), ElementsAre(kInquiry, kOnVariable + "PUT_ zVAR_PADVALUE_"));
}

TEST_F(PadValuesTest, TextsAreSetAsTheirLowBitsWithAZeroBehindThem) {
  fake.readBytes(4);
  EXPECT_EQ(errorWith(51, 3, Array::text(u"a\u20AC\u00E9")), "no error");
  EXPECT_THAT(fake.bytesRead(), ElementsAre('a', 0xAC, 0xE9, 0));
}

TEST_F(PadValuesTest, TheHostNarrowsTextsOfEitherKind) {
  for (const long datatype : {51L, 52L}) {
    narrowCopiesMade();  // those of the commands' names count, too
    EXPECT_EQ(errorWith(datatype, 4, "abcd"), "no error");
    EXPECT_EQ(narrowCopiesMade(), 2U);
  }
}

TEST_F(PadValuesTest, OnlyTheNumberOfElementsCountsNotTheShape) {
  const std::vector<double> pair{1, 2};
  EXPECT_EQ(errorWith(32, 1, Array::of(std::span<const double>(pair), {1, 2})), "no error");
  EXPECT_EQ(errorWith(32, 1, Array::of(std::span<const double>(pair), {2, 1})), "no error");
}

TEST_F(PadValuesTest, TheNumberOfElementsIsThatOfOneValue) {
  EXPECT_EQ(errorWith(51, 4, "abc"), cdflib("wrongNumberOfPadValueElements", "B", 4));
  EXPECT_EQ(errorWith(52, 4, "abcde"), cdflib("wrongNumberOfPadValueElements", "B", 4));
  EXPECT_EQ(errorWith(45, 1, {1, 2}), cdflib("wrongNumberOfPadValueElements", "B", 1));
  EXPECT_EQ(errorWith(45, 1, {}), cdflib("wrongNumberOfPadValueElements", "B", 1));
  EXPECT_EQ(errorWith(32, 1, 1), cdflib("wrongNumberOfPadValueElements", "B", 2));
}

TEST_F(PadValuesTest, TheClassIsLookedAtBeforeTheNumberOfElements) {
  EXPECT_EQ(errorWith(45, 1, row<float>({1, 2})),
            cdflib("datatypeMismatch", "single", "CDF_DOUBLE"));
  EXPECT_EQ(errorWith(51, 4, 1), cdflib("datatypeMismatch", "double", "CDF_CHAR"));
  EXPECT_THAT(calls(), ElementsAre(kInquiry, kInquiry));
}

}  // namespace
}  // namespace ambrix_test
