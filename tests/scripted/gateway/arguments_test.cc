// Conversion of arguments into native values.
#include "gateway/arguments.h"

#include <boost/numeric/conversion/cast.hpp>
#include <cmath>
#include <limits>

#include "tests/support/failure_of.h"

namespace ambrix_test {
namespace {

using namespace TOLVEX::ambrix;
using testing::ElementsAre;
using testing::IsEmpty;
using ArgumentsTest = HostTest;

constexpr long kMost = std::numeric_limits<long>::max();
constexpr long kLeast = std::numeric_limits<long>::min();
const char* const kNotText = "basic_string::_M_construct null not valid";

long scalar(const Given& argument) {
  return getLongScalarArg(argument.view().handle(), "LABEL");
}
std::vector<long> vector(const Given& argument) {
  return getLongVectorArg(argument.view().handle(), "LABEL");
}
std::string string(const Given& argument) {
  return getStringArg(argument.view().handle());
}
std::string filename(const Given& argument) {
  return getFilenameArg(argument.view().handle());
}

TEST_F(ArgumentsTest, NumbersAreTruncatedTowardZero) {
  EXPECT_EQ(scalar(3.7), 3);
  EXPECT_EQ(scalar(-3.7), -3);
  EXPECT_EQ(scalar(2.9), 2);
  EXPECT_EQ(scalar(-0.5), 0);
  EXPECT_EQ(scalar(0.999999), 0);
  EXPECT_EQ(scalar(9007199254740993.0), 9007199254740992);
}

TEST_F(ArgumentsTest, TheLargestNumbersBelowTheBoundsPass) {
  EXPECT_EQ(scalar(std::nextafter(9223372036854775808.0, 0.0)), 9223372036854774784);
  EXPECT_EQ(scalar(std::nextafter(-9223372036854775808.0, 0.0)), -9223372036854774784);
}

TEST_F(ArgumentsTest, TheBoundsThemselvesOverflow) {
  using boost::numeric::negative_overflow;
  using boost::numeric::positive_overflow;
  EXPECT_THROW(scalar(9223372036854775808.0), positive_overflow);
  EXPECT_THROW(scalar(-9223372036854775808.0), negative_overflow);
  EXPECT_THROW(scalar(std::numeric_limits<double>::infinity()), positive_overflow);
  EXPECT_THROW(scalar(-std::numeric_limits<double>::infinity()), negative_overflow);
  EXPECT_THROW(scalar(9.3e18), positive_overflow);
}

TEST_F(ArgumentsTest, NanIsTheLeastNumber) {
  const double nan = std::numeric_limits<double>::quiet_NaN();
  EXPECT_EQ(scalar(nan), kLeast);
  EXPECT_THAT(vector({1, nan, 2}), ElementsAre(1, kLeast, 2));
}

TEST_F(ArgumentsTest, AScalarIsOneDoubleAndNothingElse) {
  const Given others[] = {{},
                          {1, 2},
                          "x",
                          row<float>({1}),
                          row<std::int32_t>({5}),
                          row<std::uint64_t>({5}),
                          row<bool>({true}),
                          Array::cell({1, 1})};
  for (const Given& other : others)
    EXPECT_EQ(failureOf([&] { scalar(other); }), notScalar("LABEL"));
  EXPECT_EQ(failureOf([&] { scalar({1e300, 1}); }), notScalar("LABEL"));
}

TEST_F(ArgumentsTest, VectorsKeepTheStorageOrderWhateverTheirShape) {
  EXPECT_THAT(vector({}), IsEmpty());
  EXPECT_THAT(vector({1.5, -2.5, 3}), ElementsAre(1, -2, 3));
  const std::vector<double> numbers{1, 2, 3, 4, 5, 6};
  EXPECT_THAT(vector(Array::of(std::span<const double>(numbers), {2, 3})),
              ElementsAre(1, 2, 3, 4, 5, 6));
}

TEST_F(ArgumentsTest, TheFirstElementOutOfRangeEndsAVector) {
  EXPECT_THROW(vector({1, 2, 1e30}), boost::numeric::positive_overflow);
  EXPECT_THROW(vector({1, -1e30, 1e30}), boost::numeric::negative_overflow);
}

TEST_F(ArgumentsTest, VectorsOfOtherClassesAreTakenAsDoubles) {
  EXPECT_THAT(vector(row<float>({1.75F, -2.75F})), ElementsAre(1, -2));
  EXPECT_THAT(vector(row<std::int8_t>({-128, 127})), ElementsAre(-128, 127));
  EXPECT_THAT(vector(row<std::uint8_t>({255})), ElementsAre(255));
  EXPECT_THAT(vector(row<std::int16_t>({-32768})), ElementsAre(-32768));
  EXPECT_THAT(vector(row<std::uint16_t>({65535})), ElementsAre(65535));
  EXPECT_THAT(vector(row<std::int32_t>({-5, 6})), ElementsAre(-5, 6));
  EXPECT_THAT(vector(row<std::uint32_t>({4294967295U})), ElementsAre(4294967295));
  EXPECT_THAT(vector(row<std::int64_t>({-5, 6})), ElementsAre(-5, 6));
  EXPECT_THAT(vector(row<std::uint64_t>({7})), ElementsAre(7));
  EXPECT_THAT(vector(row<bool>({true, false})), ElementsAre(1, 0));
  EXPECT_THAT(vector("A~"), ElementsAre(65, 126));
}

TEST_F(ArgumentsTest, IntegersOf64BitsAreRoundedToDoubles) {
  constexpr std::int64_t kFirstInexact = (1LL << 53) + 1;
  EXPECT_THAT(vector(row<std::int64_t>({kFirstInexact, -kFirstInexact})),
              ElementsAre(kFirstInexact - 1, 1 - kFirstInexact));
  EXPECT_THROW(vector(row<std::int64_t>({kLeast})), boost::numeric::negative_overflow);
  EXPECT_THROW(vector(row<std::int64_t>({kMost})), boost::numeric::positive_overflow);
}

TEST_F(ArgumentsTest, AVectorsUint64BeyondTheRangeOverflows) {
  EXPECT_THROW(vector(row<std::uint64_t>({9223372036854775808U})),
               boost::numeric::positive_overflow);
  EXPECT_THROW(vector(row<float>({1e30F})), boost::numeric::positive_overflow);
}

TEST_F(ArgumentsTest, CellsAreNoVector) {
  const Given cell = Array::cell({2, 1});
  EXPECT_EQ(failureOf([&] { vector(cell); }), validate("argumentNotDoublePrecision", "LABEL"));
}

TEST_F(ArgumentsTest, AnEmptyArrayOfAnyClassIsAnEmptyVector) {
  const Given empties[] = {{}, "", row<bool>({}), row<std::int32_t>({}), Array::cell({0, 3})};
  for (const Given& empty : empties)
    EXPECT_THAT(vector(empty), IsEmpty());
}

TEST_F(ArgumentsTest, TextsKeepTheLowBitsUpToTheFirstZero) {
  EXPECT_EQ(string("abc"), "abc");
  EXPECT_EQ(string(Array::text(u"\u20AC\u00E9")), "\xAC\xE9");
  EXPECT_EQ(string(Array::fromNarrow(std::string("ab\0c", 4))), "ab");
  EXPECT_EQ(string(""), "");
}

TEST_F(ArgumentsTest, WhatIsNoTextIsALogicErrorWithTheKnownText) {
  for (const Given& other : {Given(5), Given(), row<bool>({true}), Given(Array::cell({1, 1}))}) {
    EXPECT_THROW(string(other), std::logic_error);
    EXPECT_EQ(failureOf([&] { string(other); }), kNotText);
    EXPECT_EQ(failureOf([&] { filename(other); }), kNotText);
  }
}

TEST_F(ArgumentsTest, FileNamesAreUtf8) {
  EXPECT_EQ(filename("/data/a b.cdf"), "/data/a b.cdf");
  EXPECT_EQ(filename(Array::text(u"\u00E9\u20AC\U0001F4A1.cdf")),
            "\xC3\xA9\xE2\x82\xAC\xF0\x9F\x92\xA1.cdf");
  EXPECT_EQ(filename(""), "");
}

TEST_F(ArgumentsTest, AnUnpairedSurrogateHasNoNarrowForm) {
  for (const char16_t unit : {u'\xD800', u'\xDC00'}) {
    const std::u16string name{u'a', unit, u'b'};
    EXPECT_EQ(failureOf([&] { filename(Array::text(name)); }), cdflib("invalidCharError"));
  }
}

}  // namespace
}  // namespace ambrix_test
