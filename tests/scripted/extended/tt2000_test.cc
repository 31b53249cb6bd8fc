// Nanoseconds since 2000: computed from and broken down into nine components.
#include <cmath>

#include "tests/support/scripted_test.h"

namespace ambrix_test {
namespace {

using testing::ElementsAre;
using testing::IsEmpty;

class Tt2000Test : public ScriptedTest {
 protected:
  Tt2000Test() { module.setExtended(true); }

  /// What "computeTT2000" makes of 2016-12-31T23:59:60 when the library answers this.
  std::string computed(std::int64_t answer) {
    fake.answer("computeTT2000", {answer});
    return shownOrError({2016, 12, 31, 23, 59, 60, 0, 0, 0});
  }
  std::string shownOrError(std::initializer_list<double> components) {
    const Given times =
        Array::of<double>({std::data(components), components.size()}, {9, components.size() / 9});
    try {
      return shown(module.call("computeTT2000", {times.view()}).front());
    } catch (const ::ambrix::Error& error) {
      return messageText(error.id());
    }
  }
};

constexpr std::int64_t kLeapSecond = 536500868184000000;
const std::string kIllegal = cdflib("illegalEpochValue");

TEST_F(Tt2000Test, TheLibraryGetsWholeNumbersAsDoubles) {
  fake.answer("computeTT2000", {kLeapSecond, kLeapSecond});
  EXPECT_EQ(shownOrError({2016.9, 12.5, 31.9, 23.9, 59.9, 60.9, 1.5, 2.5, 3.5}),
            "int64 1x1 [536500868184000000]");
  EXPECT_THAT(calls(), ElementsAre("computeTT2000 2016 12 31 23 59 60 1 2 3"));
}

TEST_F(Tt2000Test, AWrongCountAndAWrongClassAreTheSameError) {
  EXPECT_EQ(errorOf("computeTT2000", {elements<double>(10)}), cdflib("badEpochVector", 9));
  EXPECT_EQ(errorOf("computeTT2000", {elements<float>(9)}), cdflib("badEpochVector", 9));
  EXPECT_EQ(errorOf("computeTT2000", {elements<std::int64_t>(9)}), cdflib("badEpochVector", 9));
  EXPECT_EQ(shown(result("computeTT2000", {{}})), "int64 1x0 []");
}

TEST_F(Tt2000Test, AnIllegalTimeOfTheLibraryIsAnError) {
  EXPECT_EQ(computed(INT64_MIN + 3), kIllegal);
}

// The library reads beyond its tables of months.
TEST_F(Tt2000Test, TheLibraryNeverSeesMonthsThatDoNotExist) {
  for (const double month : {-1.0, 13.0, 1e9, 1e15, std::nan("")})
    EXPECT_EQ(shownOrError({2010, month, 1, 0, 0, 0, 0, 0, 0}), kIllegal) << month;
  EXPECT_THAT(calls(), IsEmpty());
}

// It keeps the date of its last call under a number that such days share with others.
TEST_F(Tt2000Test, TheLibraryNeverSeesDaysBeforeTheFirst) {
  for (const double day : {0.0, -1.0, -999.0, std::nan("")})
    EXPECT_EQ(shownOrError({2010, 2, day, 0, 0, 0, 0, 0, 0}), kIllegal) << day;
  EXPECT_THAT(calls(), IsEmpty());
}

TEST_F(Tt2000Test, MonthsAndDaysAtTheEdgeReachTheLibrary) {
  const std::int64_t july2010 = 331214466184000000;
  fake.answer("computeTT2000", {july2010});
  for (const auto& [month, day] : {std::pair(0.0, 1.0), {1.0, 366.0}, {12.0, 1.0}})
    EXPECT_EQ(shownOrError({2010, month, day, 0, 0, 0, 0, 0, 0}), "int64 1x1 [331214466184000000]");
}

// Sums beyond 64 bits wrap around in the library.
TEST_F(Tt2000Test, ATimeThatIsNowhereNearItsDateIsIllegal) {
  EXPECT_EQ(computed(kLeapSecond - 20000000000000000), "int64 1x1 [516500868184000000]");
  for (const std::int64_t answer : {-kLeapSecond, kLeapSecond + 40000000000000000,
                                    kLeapSecond - 40000000000000000, INT64_MIN, INT64_MIN + 1})
    EXPECT_EQ(computed(answer), kIllegal) << answer;
}

TEST_F(Tt2000Test, TwoDatesStandForTheFillAndThePadValue) {
  fake.answer("computeTT2000", {INT64_MIN});
  EXPECT_EQ(shownOrError({9999, 12, 31, 23, 59, 59, 999, 999, 999}),
            "int64 1x1 [-9223372036854775808]");
  EXPECT_EQ(shownOrError({0, 1, 1, 0, 0, 0, 0, 0, 0}), kIllegal);
  fake.answer("computeTT2000", {INT64_MIN + 1});
  EXPECT_EQ(shownOrError({0, 1, 1, 0, 0, 0, 0, 0, 0}), "int64 1x1 [-9223372036854775807]");
  EXPECT_EQ(shownOrError({9999, 12, 31, 23, 59, 59, 999, 999, 999}), kIllegal);
}

TEST_F(Tt2000Test, TheFirstIllegalTimeEndsTheCommand) {
  fake.answer("computeTT2000", {INT64_MIN + 3});
  EXPECT_EQ(errorOf("computeTT2000", {elements<double>(27)}), kIllegal);
}

TEST_F(Tt2000Test, ALaterComponentOutOfRangeComesBeforeAnIllegalTime) {
  EXPECT_EQ(shownOrError({0, 13, 0, 0, 0, 0, 0, 0, 0, 2000, 1, 1, 0, 0, 0, 0, 0, 1e19}),
            validate("argumentOutOfBounds"));
}

TEST_F(Tt2000Test, EachTimeIsBrokenDownIntoAColumn) {
  fake.answer("breakdownTT2000", {2000, 1, 2, 3, 4, 5, 6, 7, 8});
  EXPECT_EQ(shown(result("tt2000Breakdown", {row<std::int64_t>({5, -6})})),
            "double 9x2 [2000 1 2 3 4 5 6 7 8 2000 1 2 3 4 5 6 7 8]");
  EXPECT_THAT(calls(), ElementsAre("breakdownTT2000 5", "breakdownTT2000 -6"));
  EXPECT_EQ(shown(result("tt2000Breakdown", {elements<std::int64_t>(0)})), "double 9x0 []");
}

TEST_F(Tt2000Test, OnlyInt64IsBrokenDown) {
  EXPECT_EQ(errorOf("tt2000Breakdown", {5}),
            cdflib("datatypeMismatch", "double", "CDF_TIME_TT2000"));
  EXPECT_EQ(errorOf("tt2000Breakdown", {elements<std::uint64_t>(1)}),
            cdflib("datatypeMismatch", "uint64", "CDF_TIME_TT2000"));
  EXPECT_EQ(errorOf("tt2000Breakdown", {{}}),
            cdflib("datatypeMismatch", "double", "CDF_TIME_TT2000"));
}

}  // namespace
}  // namespace ambrix_test
