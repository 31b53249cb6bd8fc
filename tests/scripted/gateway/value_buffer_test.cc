// The buffer for values whose number and datatype are known only at run time, and its arithmetic.
#include "gateway/value_buffer.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <new>

#include "gateway/sizes.h"
#include "tests/support/datatypes.h"

namespace ambrix_test {
namespace {

using namespace TOLVEX::ambrix;
using testing::ElementsAre;

std::size_t bytesFor(long datatype, long count) {
  ValueBuffer buffer;
  resizeValueBuffer(buffer, datatype, count);
  return buffer.size();
}

TEST(ValueBufferTest, EachDatatypeHasItsSizeAndCharactersRoomForATerminator) {
  for (const CdfDatatype& datatype : kCdfDatatypes) {
    const std::size_t terminator = isText(datatype) ? 1 : 0;
    EXPECT_EQ(bytesFor(datatype.code, 5), 5 * datatype.bytes + terminator) << datatype.name;
    EXPECT_EQ(bytesFor(datatype.code, 0), terminator) << datatype.name;
  }
}

TEST(ValueBufferTest, OtherDatatypesEmptyTheBuffer) {
  for (const long datatype : {0L, 3L, 8L, 33L, 53L, -1L, 4294967297L}) {
    ValueBuffer buffer(4, 1);
    resizeValueBuffer(buffer, datatype, 5);
    EXPECT_TRUE(buffer.empty()) << datatype;
  }
}

TEST(ValueBufferTest, GrowingFillsWithZerosAndShrinkingKeepsTheStart) {
  ValueBuffer buffer{1, 2, 3};
  resizeValueBuffer(buffer, 1, 5);
  EXPECT_THAT(buffer, ElementsAre(1, 2, 3, 0, 0));
  resizeValueBuffer(buffer, 1, 2);
  EXPECT_THAT(buffer, ElementsAre(1, 2));
}

TEST(ValueBufferTest, CountsBeyondMemoryAreAMemoryFailure) {
  ValueBuffer buffer;
  EXPECT_THROW(resizeValueBuffer(buffer, 51, kLongMax), std::bad_alloc);
}

TEST(SizesTest, ProductsStopAtTheNearestLong) {
  EXPECT_EQ(multiplySaturated(6, -7), -42);
  EXPECT_EQ(multiplySaturated(kLongMax, 2), kLongMax);
  EXPECT_EQ(multiplySaturated(kLongMin, -1), kLongMax);
  EXPECT_EQ(multiplySaturated(kLongMax, -2), kLongMin);
  EXPECT_EQ(multiplySaturated(-3, kLongMax), kLongMin);
}

TEST(SizesTest, ProductsOfMany) {
  const long four[] = {2, 3, 4, 5};
  EXPECT_EQ(productOf(four), 120);
  EXPECT_EQ(productOf({}), 1);
  const long withZero[] = {kLongMax, kLongMax, 0};
  EXPECT_EQ(productOf(withZero), 0);
  const long tooMuch[] = {1L << 32, 1L << 32};
  EXPECT_EQ(productOf(tooMuch), kLongMax);
}

TEST(SizesTest, NegativeNumbersOfBytesCountAsNone) {
  EXPECT_EQ(saturatedProduct({-3, 5}), 0U);
  EXPECT_EQ(saturatedProduct({-3, -5}), 15U);
  EXPECT_EQ(saturatedProduct({3, 5}), 15U);
  EXPECT_EQ(saturatedProduct({kLongMax, 5}), static_cast<std::size_t>(kLongMax));
}

}  // namespace
}  // namespace ambrix_test
