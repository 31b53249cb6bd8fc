// Reading one record.
#include <numeric>

#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using ReadRecordTest = ScriptedTest;

TEST_F(ReadRecordTest, ARecordHasTheShapeOfTheVariableInTheHostsOrder) {
  describe({.datatype = 2, .sizes = {3, 4}, .majority = 1});
  std::vector<std::int16_t> values(12);
  std::iota(values.begin(), values.end(), std::int16_t{1});
  fake.answerData(values);
  EXPECT_EQ(shown(result("getVarRecordData", {file(), 3, 5})),
            "int16 4x3 [1 2 3 4 5 6 7 8 9 10 11 12]");
  EXPECT_THAT(calls(), ElementsAre(kInquiry, kMajority, "CDFgetVarRecordData 7 1 3 5"));
  fake.answer("CDF_MAJORITY_", {2});
  EXPECT_EQ(shown(result("getVarRecordData", {file(), 3, 5})),
            "int16 3x4 [1 2 3 4 5 6 7 8 9 10 11 12]");
}

TEST_F(ReadRecordTest, AScalarRecordIsOneByOne) {
  describe({.datatype = 21});
  fake.answerData(std::vector<float>{1.5F});
  EXPECT_EQ(shown(result("getVarRecordData", {file(), 3, 0})), "single 1x1 [1.5]");
}

TEST_F(ReadRecordTest, TextsHaveTheirCharactersInFront) {
  const std::string text = "abcdefghij";
  fake.answerData(std::vector<char>(text.begin(), text.end()));
  describe({.datatype = 51, .elements = 10});
  EXPECT_EQ(shown(result("getVarRecordData", {file(), 3, 0})), "char 10x1 'abcdefghij'");
  describe({.datatype = 51, .elements = 2, .sizes = {5}, .majority = 1});
  EXPECT_EQ(shown(result("getVarRecordData", {file(), 3, 0})), "char 2x5 'abcdefghij'");
  describe({.datatype = 51, .elements = 1, .sizes = {10}});
  EXPECT_EQ(shown(result("getVarRecordData", {file(), 3, 0})), "char 10x1 'abcdefghij'");
}

TEST_F(ReadRecordTest, Epoch16sArePairs) {
  describe({.datatype = 32, .sizes = {2}});
  fake.answerData(std::vector<double>{1, 2, 3, 4});
  EXPECT_EQ(shown(result("getVarRecordData", {file(), 3, 0})), "double 2x2 [1 2 3 4]");
}

TEST_F(ReadRecordTest, WhatTheLibraryLeavesUnwrittenReadsAsZeros) {
  describe({.datatype = 4, .sizes = {2, 3}, .variances = {-1, 0}});
  fake.answerData(std::vector<std::int32_t>{8, 9});
  EXPECT_EQ(shown(result("getVarRecordData", {file(), 3, 0})), "int32 2x3 [8 9 0 0 0 0]");
  describe({.datatype = 51, .elements = 2, .sizes = {2}, .variances = {0}});
  fake.answerData(std::vector<char>{'a', 'b'});
  EXPECT_EQ(shown(result("getVarRecordData", {file(), 3, 0})), "char 2x2 'ab\\x0\\x0'");
}

TEST_F(ReadRecordTest, ANegativeRecordNeverReachesTheRoutine) {
  describe({});
  for (const double record : {-1.0, -2147483648.0, 4294967296.0, -4294967296.0}) {
    EXPECT_EQ(errorOf("getVarRecordData", {file(), 3, record}),
              libraryFailure("CDFgetzVarRecordData", -2009));
    EXPECT_THAT(calls(), ElementsAre(kInquiry, kMajority));
  }
}

TEST_F(ReadRecordTest, AVariableNumberIsNotCutByTheRoutine) {
  describe({.datatype = 4});
  result("getVarRecordData", {file(), -4611686018427387904.0, 0});
  EXPECT_EQ(calls().back(), "CDFgetVarRecordData 7 1 -1 0");
  call("putVarRecordData", {file(), 4294967296.0, 0, row<std::int32_t>({1})});
  EXPECT_THAT(calls().back(), testing::StartsWith("CDFputVarRecordData 7 1 2147483647 0"));
}

TEST_F(ReadRecordTest, AnUnsupportedDatatypeComesBeforeTheMajority) {
  describe({.datatype = 33});
  EXPECT_EQ(errorOf("getVarRecordData", {file(), 3, 0}), unrecognized(33, "DATATYPE"));
  EXPECT_THAT(calls(), ElementsAre(kInquiry));
}

TEST_F(ReadRecordTest, ADamagedDescriptionIsRefusedInTheLibrarysWords) {
  describe({.datatype = 4, .elements = 1000, .sizes = {2}});
  EXPECT_EQ(errorOf("getVarRecordData", {file(), 3, 0}),
            libraryFailure("CDFgetzVarRecordData", -2011));
  describe({.datatype = 1, .sizes = {65536, 32768}});
  EXPECT_EQ(errorOf("getVarRecordData", {file(), 3, 0}),
            libraryFailure("CDFgetzVarRecordData", -2004));
  describe({.datatype = 1, .sizes = {-1}});
  EXPECT_EQ(errorOf("getVarRecordData", {file(), 3, 0}),
            libraryFailure("CDFgetzVarRecordData", -2004));
}

}  // namespace
}  // namespace ambrix_test
