// Arrays as a C++ program makes and reads them.
#include <ambrix/array.h>
#include <ambrix/memory.h>
#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <cstdint>
#include <stdexcept>
#include <string>
#include <utility>

namespace {

using ambrix::Array;
using ambrix::ArrayView;
using ambrix::ClassId;
using testing::Each;
using testing::ElementsAre;

struct ClassCase {
  ClassId classId;
  const char* name;
  std::size_t bytes;
};

constexpr ClassCase kClasses[] = {
    {ClassId::kLogical, "logical", 1}, {ClassId::kChar, "char", 2},
    {ClassId::kDouble, "double", 8},   {ClassId::kSingle, "single", 4},
    {ClassId::kInt8, "int8", 1},       {ClassId::kUint8, "uint8", 1},
    {ClassId::kInt16, "int16", 2},     {ClassId::kUint16, "uint16", 2},
    {ClassId::kInt32, "int32", 4},     {ClassId::kUint32, "uint32", 4},
    {ClassId::kInt64, "int64", 8},     {ClassId::kUint64, "uint64", 8}};

static_assert(ambrix::classIdOf<double>() == ClassId::kDouble);
static_assert(ambrix::classIdOf<float>() == ClassId::kSingle);
static_assert(ambrix::classIdOf<bool>() == ClassId::kLogical);
static_assert(ambrix::classIdOf<char16_t>() == ClassId::kChar);
static_assert(ambrix::classIdOf<std::int8_t>() == ClassId::kInt8);
static_assert(ambrix::classIdOf<std::uint16_t>() == ClassId::kUint16);
static_assert(ambrix::classIdOf<std::int64_t>() == ClassId::kInt64);
static_assert(ambrix::classIdOf<long long>() == ClassId::kInt64);
static_assert(!ambrix::ArrayElement<char> && !ambrix::ArrayElement<wchar_t>);

class EmbeddedArrayTest : public testing::Test {
 protected:
  void TearDown() override { EXPECT_EQ(ambrix::liveCounts(), ambrix::LiveCounts{}); }
};

TEST_F(EmbeddedArrayTest, EveryClassHasItsNameAndElementSize) {
  for (const ClassCase& expected : kClasses) {
    for (const std::size_t columns : {3U, 3000U}) {  // with the array, and in memory of their own
      const Array array = Array::zeros(expected.classId, {2, columns});
      EXPECT_EQ(array.classId(), expected.classId);
      EXPECT_STREQ(array.className(), expected.name);
      EXPECT_EQ(array.elementCount(), 2 * columns);
      EXPECT_EQ(array.bytes().size(), 2 * columns * expected.bytes);
      EXPECT_THAT(array.bytes(), Each(std::byte{0}));
    }
  }
  EXPECT_STREQ(Array::cell({1, 1}).className(), "cell");
}

TEST_F(EmbeddedArrayTest, SizesHaveAtLeastTwoDimensionsAndNoTrailingOnes) {
  const auto sizesOf = [](ambrix::Sizes sizes) {
    const Array array = Array::zeros(ClassId::kInt8, sizes);
    return std::vector<std::size_t>(array.size().begin(), array.size().end());
  };
  EXPECT_THAT(sizesOf({5}), ElementsAre(5, 1));
  EXPECT_THAT(sizesOf({0}), ElementsAre(0, 1));
  EXPECT_THAT(sizesOf(std::vector<std::size_t>{}), ElementsAre(0, 0));
  EXPECT_THAT(sizesOf({1, 5}), ElementsAre(1, 5));
  EXPECT_THAT(sizesOf({2, 3, 4}), ElementsAre(2, 3, 4));
  EXPECT_THAT(sizesOf({2, 3, 1, 1}), ElementsAre(2, 3));
  EXPECT_THAT(sizesOf({1, 1, 1}), ElementsAre(1, 1));
  EXPECT_THAT(sizesOf({2, 1, 3, 1}), ElementsAre(2, 1, 3));
  EXPECT_THAT(sizesOf({2, 3, 0}), ElementsAre(2, 3, 0));
  EXPECT_THAT(sizesOf({1, 1, 1, 1, 1, 1, 1, 1, 1, 1, 1, 2}).size(), 12);
}

TEST_F(EmbeddedArrayTest, ValuesComeBackAsTheyWentIn) {
  const std::vector<double> values = {1.5, -2, 3e300, 4, 5, 6};
  const Array array = Array::of<double>(values, {3, 2});
  EXPECT_THAT(array.data<double>(), testing::ElementsAreArray(values));
  EXPECT_EQ(Array::scalar(std::uint64_t{0xFFFFFFFFFFFFFFFF}).data<std::uint64_t>()[0],
            0xFFFFFFFFFFFFFFFF);
  EXPECT_THAT(Array::row({true, false}).data<bool>(), ElementsAre(true, false));
  EXPECT_THAT(Array::row({true, false}).size(), ElementsAre(1, 2));
}

TEST_F(EmbeddedArrayTest, ElementsCanBeWritten) {
  Array array = Array::uninitialized(ClassId::kInt16, {1, 2});
  array.mutableData<std::int16_t>()[0] = -1;
  array.mutableData<std::int16_t>()[1] = 300;
  EXPECT_THAT(array.data<std::int16_t>(), ElementsAre(-1, 300));
}

TEST_F(EmbeddedArrayTest, DataOfAnotherClassOrSizeAreRefused) {
  const Array array = Array::scalar(1.0);
  EXPECT_THROW((void)array.data<float>(), std::logic_error);
  EXPECT_THROW((void)array.chars(), std::logic_error);
  EXPECT_THROW((void)array.element(0), std::logic_error);
  const std::vector<double> three(3);
  EXPECT_THROW(Array::of<double>(three, {2, 2}), std::invalid_argument);
  EXPECT_THROW(Array::fromBytes(ClassId::kCell, {1, 1}, std::as_bytes(std::span(three))),
               std::invalid_argument);
  EXPECT_THROW(Array::zeros(ClassId::kUnknown, {1, 1}), std::logic_error);
  EXPECT_THROW((void)Array().data<double>(), std::logic_error);
}

TEST_F(EmbeddedArrayTest, TextsAreRowsAndEmptyTextsHaveNoSize) {
  const Array text = Array::fromUtf8("a\u20ac\U0001F600");
  EXPECT_EQ(text.text(), u"a\u20ac\U0001F600");
  EXPECT_EQ(text.utf8(), "a\u20ac\U0001F600");
  EXPECT_THAT(text.size(), ElementsAre(1, 4));
  EXPECT_EQ(Array::fromNarrow("\xe9\xff").text(), u"\u00e9\u00ff");
  EXPECT_EQ(Array::text(u"\xD800").utf8(), "\uFFFD");
  EXPECT_THAT(Array::text(u"").size(), ElementsAre(0, 0));
  EXPECT_THAT(Array::fromUtf8("").size(), ElementsAre(0, 0));
  EXPECT_THAT(Array::fromNarrow("").size(), ElementsAre(0, 0));
  EXPECT_EQ(Array::fromNarrow("").text(), u"");
  EXPECT_THROW(Array::fromUtf8("\xff"), std::invalid_argument);
}

TEST_F(EmbeddedArrayTest, MovingLeavesAnEmptyHandle) {
  Array first = Array::scalar(1.0);
  Array second = std::move(first);
  EXPECT_FALSE(first);
  EXPECT_TRUE(second);
  second = Array::scalar(2.0);
  EXPECT_EQ(ambrix::liveCounts().arrays, 1U);
  Array& alias = second;
  second = std::move(alias);
  EXPECT_EQ(second.data<double>()[0], 2.0);
  Array third = Array::adopt(second.release());
  EXPECT_FALSE(second);
  EXPECT_EQ(third.data<double>()[0], 2.0);
}

TEST_F(EmbeddedArrayTest, CellsOwnWhatTheyHold) {
  Array cell = Array::cell({2, 2});
  EXPECT_FALSE(cell.element(3));
  cell.setElement(3, Array::scalar(1.0));
  cell.setElement(3, Array::scalar(2.0));
  EXPECT_EQ(cell.element(3).data<double>()[0], 2.0);
  EXPECT_EQ(ambrix::liveCounts().arrays, 2U);
  EXPECT_TRUE(cell.bytes().empty());
  cell.setElement(3, Array());
  EXPECT_FALSE(cell.element(3));
  EXPECT_THROW((void)cell.element(4), std::out_of_range);
  EXPECT_THROW(cell.setElement(4, Array::scalar(1.0)), std::out_of_range);
  EXPECT_THROW(cell.setElement(0, std::move(cell)), std::logic_error);
}

TEST_F(EmbeddedArrayTest, CopiesAreDeep) {
  Array inner = Array::cell({1, 2});
  inner.setElement(1, Array::fromUtf8("deep"));
  Array cell = Array::cell({3, 1});
  cell.setElement(0, std::move(inner));
  cell.setElement(2, Array::zeros(ClassId::kDouble, {100, 1, 2}));
  const Array copy = cell.clone();
  cell = Array();
  EXPECT_EQ(copy.element(0).element(1).utf8(), "deep");
  EXPECT_FALSE(copy.element(0).element(0));
  EXPECT_FALSE(copy.element(1));
  EXPECT_THAT(copy.element(2).size(), ElementsAre(100, 1, 2));
  EXPECT_EQ(ambrix::liveCounts().arrays, 4U);
  EXPECT_FALSE(Array().clone());
}

TEST_F(EmbeddedArrayTest, CellsMayNestVeryDeeply) {
  Array nested = Array::scalar(1.0);
  for (int level = 0; level < 200'000; ++level) {
    Array outer = Array::cell({1, 1});
    outer.setElement(0, std::move(nested));
    nested = std::move(outer);
  }
  const Array copy = nested.clone();
  EXPECT_EQ(ambrix::liveCounts().arrays, 400'002U);
}

}  // namespace
