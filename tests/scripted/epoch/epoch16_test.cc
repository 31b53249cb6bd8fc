// Epochs of two doubles: computed from and broken down into ten components.
#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;
using testing::SizeIs;
using Epoch16Test = ScriptedTest;

Given shaped(std::initializer_list<std::size_t> sizes) {
  return Array::zeros(ClassId::kDouble, sizes);
}

TEST_F(Epoch16Test, EachGroupOfTenFillsAColumn) {
  const Given times{2000, 1, 2, 3, 4, 5, 6, 7, 8, 9.9, 1999, 12, 31, 23, 59, 58, 1, 2, 3, 4};
  EXPECT_EQ(shown(result("computeEpoch16", {times})), "double 2x2 [2000 9 1999 4]");
  EXPECT_THAT(calls(), ElementsAre("computeEPOCH16 2000 1 2 3 4 5 6 7 8 9",
                                   "computeEPOCH16 1999 12 31 23 59 58 1 2 3 4"));
}

TEST_F(Epoch16Test, AWrongCountAndAWrongClassAreTheSameError) {
  EXPECT_EQ(errorOf("computeEpoch16", {elements<double>(7)}), cdflib("badEpochVector", 10));
  EXPECT_EQ(errorOf("computeEpoch16", {elements<float>(10)}), cdflib("badEpochVector", 10));
  EXPECT_EQ(shown(result("computeEpoch16", {{}})), "double 2x0 []");
}

TEST_F(Epoch16Test, AnIllegalEpochEndsTheCommandAtOnce) {
  fake.answerEpochs({0, -1.0, 0});
  EXPECT_EQ(errorOf("computeEpoch16", {elements<double>(30)}), cdflib("illegalEpochValue"));
  EXPECT_THAT(calls(), SizeIs(2));
}

TEST_F(Epoch16Test, EachPairIsBrokenDownIntoAColumn) {
  fake.answer("EPOCH16breakdown", {2000, 1, 2, 3, 4, 5, 6, 7, 8, 9});
  EXPECT_EQ(shown(result("epoch16Breakdown", {{1, 2, 3, 4}})),
            "double 10x2 [2000 1 2 3 4 5 6 7 8 9 2000 1 2 3 4 5 6 7 8 9]");
  EXPECT_THAT(calls(), ElementsAre("EPOCH16breakdown 1 2", "EPOCH16breakdown 3 4"));
}

TEST_F(Epoch16Test, TheFurtherDimensionsOfATwoByInputStay) {
  const std::pair<Given, std::vector<std::size_t>> shapes[] = {
      {shaped({2, 3}), {10, 3}}, {shaped({1, 6}), {10, 3}},       {shaped({6, 1}), {10, 3}},
      {shaped({2, 1}), {10, 1}}, {shaped({2, 3, 4}), {10, 3, 4}}, {shaped({4, 3, 2}), {10, 12}},
      {shaped({0, 0}), {10, 0}}, {shaped({2, 0}), {10, 0}}};
  for (const auto& [input, sizes] : shapes)
    EXPECT_THAT(result("epoch16Breakdown", {input}).size(), testing::ElementsAreArray(sizes));
}

TEST_F(Epoch16Test, AnOddCountComesBeforeAWrongClass) {
  EXPECT_EQ(errorOf("epoch16Breakdown", {elements<float>(3)}), cdflib("badEpoch16Modulus"));
  EXPECT_EQ(errorOf("epoch16Breakdown", {elements<double>(3)}), cdflib("badEpoch16Modulus"));
  EXPECT_EQ(errorOf("epoch16Breakdown", {elements<float>(2)}),
            validate("argumentNotDoublePrecision", "EPOCH16TIME"));
  EXPECT_THAT(calls(), IsEmpty());
}

}  // namespace
}  // namespace ambrix_test
