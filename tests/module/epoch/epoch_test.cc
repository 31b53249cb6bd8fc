// Calendar times to epochs and back.
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using EpochTest = ModuleTest;

const std::string kIllegal = "TOLVEX:ambrix:cdflib:illegalEpochValue()";

Given matrix(std::initializer_list<double> values, ::ambrix::Sizes sizes) {
  return Array::of<double>({std::data(values), values.size()}, sizes);
}

TEST_F(EpochTest, ComputesKnownEpochs) {
  EXPECT_EQ(does("computeEpoch", {{2000, 1, 1, 0, 0, 0, 0}}), "double 1x1 [63113904000000]");
  EXPECT_EQ(does("computeEpoch", {{1970, 1, 1, 0, 0, 0, 0}}), "double 1x1 [62167219200000]");
  EXPECT_EQ(does("computeEpoch", {{2000, 1, 1, 0, 0, 0, 1}}), "double 1x1 [63113904000001]");
  EXPECT_EQ(does("computeEpoch", {{2000, 2, 29, 23, 59, 59, 999}}), "double 1x1 [63119087999999]");
}

TEST_F(EpochTest, EachGroupOfSevenIsATimeWhateverTheShape) {
  const std::initializer_list<double> twoTimes = {2000, 1, 1, 0, 0, 0, 0, 1970, 1, 1, 0, 0, 0, 0};
  const char* expected = "double 1x2 [63113904000000 62167219200000]";
  EXPECT_EQ(does("computeEpoch", {matrix(twoTimes, {7, 2})}), expected);
  EXPECT_EQ(does("computeEpoch", {matrix(twoTimes, {2, 7})}), expected);
  EXPECT_EQ(does("computeEpoch", {matrix(twoTimes, {14, 1})}), expected);
}

TEST_F(EpochTest, ComponentsAreTruncatedTowardZero) {
  EXPECT_EQ(does("computeEpoch", {{2000.9, 1.9, 1.5, 0.99, -0.5, 0, 0}}),
            "double 1x1 [63113904000000]");
}

TEST_F(EpochTest, NoTimesGiveNoEpochs) {
  EXPECT_EQ(does("computeEpoch", {{}}), "double 1x0 []");
  EXPECT_EQ(does("computeEpoch16", {{}}), "double 2x0 []");
  EXPECT_EQ(does("epochBreakdown", {{}}), "double 7x0 []");
  EXPECT_EQ(does("epoch16Breakdown", {{}}), "double 10x0 []");
}

TEST_F(EpochTest, AnIllegalTimeEndsTheCommand) {
  EXPECT_EQ(does("computeEpoch", {{-1, 1, 1, 0, 0, 0, 0}}), kIllegal);
  EXPECT_EQ(does("computeEpoch", {{0, 0, 0, 0, 0, 0, 0}}), kIllegal);
  EXPECT_EQ(does("computeEpoch", {{2000, 1, 1, 0, 0, 0, 0, -1, 1, 1, 0, 0, 0, 0}}), kIllegal);
  EXPECT_EQ(does("computeEpoch16", {{-1, 1, 1, 0, 0, 0, 0, 0, 0, 0}}), kIllegal);
}

TEST_F(EpochTest, AComponentOutOfRangeIsToldBeforeAnIllegalTime) {
  EXPECT_EQ(does("computeEpoch", {{-1, 1, 1, 0, 0, 0, 0, 2000, 1, 1, 0, 0, 0, 1e30}}),
            kOutOfBounds);
  EXPECT_EQ(does("computeEpoch16", {{1e30, 1, 1, 0, 0, 0, 0, 0, 0, 0}}), kOutOfBounds);
}

TEST_F(EpochTest, ComputesSecondsAndPicosecondsOfAnEpoch16) {
  EXPECT_EQ(does("computeEpoch16", {{2000, 1, 1, 0, 0, 0, 1, 2, 3, 4}}),
            "double 2x1 [63113904000 1002003004]");
  const std::initializer_list<double> twoTimes = {2000, 1, 1, 0, 0, 0, 0,   0,   0,   0,
                                                  2000, 1, 1, 0, 0, 1, 999, 999, 999, 999};
  EXPECT_EQ(does("computeEpoch16", {matrix(twoTimes, {10, 2})}),
            "double 2x2 [63113904000 0 63113904001 999999999999]");
}

TEST_F(EpochTest, BreaksEpochsDown) {
  EXPECT_EQ(does("epochBreakdown", {63113904000000.0}), "double 7x1 [2000 1 1 0 0 0 0]");
  EXPECT_EQ(does("epochBreakdown", {{63113904000001.0, 62167219200000.0}}),
            "double 7x2 [2000 1 1 0 0 0 1 1970 1 1 0 0 0 0]");
  EXPECT_EQ(does("epochBreakdown", {matrix({0, 63119087999999.0}, {2, 1})}),
            "double 7x2 [0 1 1 0 0 0 0 2000 2 29 23 59 59 999]");
}

TEST_F(EpochTest, TheFillValueIsTheEndOfTime) {
  EXPECT_EQ(does("epochBreakdown", {-1e31}), "double 7x1 [9999 12 31 23 59 59 999]");
}

TEST_F(EpochTest, BreaksEpoch16sDown) {
  EXPECT_EQ(does("epoch16Breakdown", {matrix({63113904000.0, 1002003004.0}, {2, 1})}),
            "double 10x1 [2000 1 1 0 0 0 1 2 3 4]");
}

TEST_F(EpochTest, TheShapeOfEpoch16sFollowsTheInput) {
  const auto sizeOf = [this](::ambrix::Sizes sizes) {
    const Array times = result("epoch16Breakdown", {Array::zeros(ClassId::kDouble, sizes)});
    return std::vector<std::size_t>(times.size().begin(), times.size().end());
  };
  using testing::ElementsAre;
  EXPECT_THAT(sizeOf({2, 3}), ElementsAre(10, 3));
  EXPECT_THAT(sizeOf({2, 3, 4}), ElementsAre(10, 3, 4));
  EXPECT_THAT(sizeOf({1, 4}), ElementsAre(10, 2));
  EXPECT_THAT(sizeOf({4, 1}), ElementsAre(10, 2));
  EXPECT_THAT(sizeOf({1, 6}), ElementsAre(10, 3));
  EXPECT_THAT(sizeOf({4, 3}), ElementsAre(10, 6));
  EXPECT_THAT(sizeOf({3, 2, 2}), ElementsAre(10, 6));
  EXPECT_THAT(sizeOf({2, 0}), ElementsAre(10, 0));
}

TEST_F(EpochTest, TimesGoThereAndBack) {
  for (const double epoch : {0.0, 1.0, 62167219200000.0, 64000000000123.0}) {
    const Array times = result("epochBreakdown", {epoch});
    EXPECT_EQ(number("computeEpoch", {times.clone()}), epoch);
  }
}

}  // namespace
}  // namespace ambrix_test
