// Epochs of one double: computed from and broken down into seven components.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;
using EpochTest = ScriptedTest;

TEST_F(EpochTest, EachGroupOfSevenIsComputed) {
  fake.answerEpochs({6.3e13, 5});
  const std::vector<double> times{2000, 1, 2, 3, 4, 5.9, 6, 1999, 12, 31, 23, 59, 58, 999};
  const Given columns = Array::of(std::span<const double>(times), {7, 2});
  EXPECT_EQ(shown(result("computeEpoch", {columns})), "double 1x2 [63000000000000 5]");
  EXPECT_THAT(calls(),
              ElementsAre("computeEPOCH 2000 1 2 3 4 5 6", "computeEPOCH 1999 12 31 23 59 58 999"));
}

TEST_F(EpochTest, OnlyTheOrderOfElementsCountsNotTheShape) {
  const std::vector<double> times{1, 2, 3, 4, 5, 6, 7, 8, 9, 10, 11, 12, 13, 14};
  const Given rows = Array::of(std::span<const double>(times), {2, 7});
  result("computeEpoch", {rows});
  EXPECT_THAT(calls(),
              ElementsAre("computeEPOCH 1 2 3 4 5 6 7", "computeEPOCH 8 9 10 11 12 13 14"));
}

TEST_F(EpochTest, NoTimesGiveOneRowOfNothing) {
  EXPECT_EQ(shown(result("computeEpoch", {{}})), "double 1x0 []");
  EXPECT_EQ(shown(result("epochBreakdown", {{}})), "double 7x0 []");
}

TEST_F(EpochTest, AWrongCountAndAWrongClassAreTheSameError) {
  EXPECT_EQ(errorOf("computeEpoch", {{1, 2, 3}}), cdflib("badEpochVector", 7));
  EXPECT_EQ(errorOf("computeEpoch", {elements<double>(10)}), cdflib("badEpochVector", 7));
  EXPECT_EQ(errorOf("computeEpoch", {elements<float>(7)}), cdflib("badEpochVector", 7));
  EXPECT_EQ(errorOf("computeEpoch", {elements<float>(0)}), cdflib("badEpochVector", 7));
  EXPECT_EQ(errorOf("computeEpoch", {"seven!!"}), cdflib("badEpochVector", 7));
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(EpochTest, AnIllegalEpochEndsTheCommandAtOnce) {
  fake.answerEpochs({5, -1.0, 6});
  EXPECT_EQ(errorOf("computeEpoch", {elements<double>(21)}), cdflib("illegalEpochValue"));
  EXPECT_THAT(calls(), SizeIs(2));
}

TEST_F(EpochTest, AComponentOutOfRangeIsToldBeforeAnIllegalTime) {
  std::vector<double> times(14, 1);
  times[13] = 1e30;
  fake.answerEpochs({-1.0, 5});
  EXPECT_EQ(errorOf("computeEpoch", {Array::row(std::span<const double>(times))}),
            validate("argumentOutOfBounds"));
  EXPECT_THAT(calls(), SizeIs(1));
}

TEST_F(EpochTest, EpochsAreBrokenDownIntoColumns) {
  fake.answer("EPOCHbreakdown", {2000, 1, 2, 3, 4, 5, 6});
  EXPECT_EQ(shown(result("epochBreakdown", {{10.5, -1}})),
            "double 7x2 [2000 1 2 3 4 5 6 2000 1 2 3 4 5 6]");
  EXPECT_THAT(calls(), ElementsAre("EPOCHbreakdown 10.5", "EPOCHbreakdown -1"));
}

TEST_F(EpochTest, WhatTheLibraryMakesOfAnInvalidEpochIsStored) {
  fake.answer("EPOCHbreakdown", {-1, 0, 0, 0, 0, 0, 0});
  EXPECT_EQ(shown(result("epochBreakdown", {-1.0})), "double 7x1 [-1 0 0 0 0 0 0]");
}

TEST_F(EpochTest, OnlyDoublesAreBrokenDown) {
  EXPECT_EQ(errorOf("epochBreakdown", {elements<float>(1)}),
            validate("argumentNotDoublePrecision", "EPOCHTIME"));
  EXPECT_EQ(errorOf("epochBreakdown", {elements<std::int64_t>(0)}),
            validate("argumentNotDoublePrecision", "EPOCHTIME"));
}

}  // namespace
}  // namespace ambrix_test
