// Calendar times to `CDF_TIME_TT2000` and back, by the library's own table of leap seconds.
#include <cdf.h>

#include <array>
#include <cmath>
#include <cstdint>
#include <random>

#include "tests/module/support/leak_check.h"
#include "tests/module/support/module_test.h"

namespace ambrix_test {
namespace {

using Components = std::array<double, 9>;
constexpr std::int64_t kSecond = 1000000000;
const std::string kIllegal = "TOLVEX:ambrix:cdflib:illegalEpochValue()";

class Tt2000Test : public ModuleTest {
 protected:
  Tt2000Test() { module.setExtended(true); }

  std::string computed(const Components& time) {
    return does("computeTT2000", {Array::of<double>(time, {9, 1})});
  }
  std::int64_t timeOf(const Components& time) {
    return result("computeTT2000", {Array::of<double>(time, {9, 1})}).data<std::int64_t>()[0];
  }
  std::string brokenDown(std::int64_t time) {
    return does("tt2000Breakdown", {row<std::int64_t>({time})});
  }
  Components componentsOf(std::int64_t time) {
    Components found{};
    const Array columns = result("tt2000Breakdown", {row<std::int64_t>({time})});
    std::ranges::copy(columns.data<double>(), found.begin());
    return found;
  }

 private:
  LeaksIgnored libraryTable_;  // of leap seconds, which the library makes once and never frees
};

std::string shownTime(std::int64_t value) {
  return "int64 1x1 [" + std::to_string(value) + "]";
}

/// The library's rows: year, month, day, seconds, and two numbers of the drift before 1972.
std::vector<std::array<double, 6>> leapSeconds() {
  std::vector<std::array<double, 6>> rows(static_cast<std::size_t>(CDFgetRowsinLeapSecondsTable()));
  std::vector<double*> places;
  for (std::array<double, 6>& row : rows)
    places.push_back(row.data());
  CDFfillLeapSecondsTable(places.data());
  return rows;
}

TEST_F(Tt2000Test, KnownTimes) {
  EXPECT_EQ(computed({2000, 1, 1, 11, 58, 55, 816, 0, 0}), shownTime(0));
  EXPECT_EQ(computed({2000, 1, 1, 12, 0, 0, 0, 0, 0}), shownTime(64184000000));
  EXPECT_EQ(computed({2016, 12, 31, 23, 59, 60, 0, 0, 0}), shownTime(536500868184000000));
  EXPECT_EQ(computed({2017, 1, 1, 0, 0, 0, 0, 0, 0}), shownTime(536500869184000000));
  EXPECT_EQ(computed({1965, 6, 15, 1, 2, 3, 4, 5, 6}), shownTime(-1090234640957376994));
  EXPECT_EQ(computed({1800, 5, 6, 7, 8, 9, 10, 11, 12}), shownTime(-6300564678805988988));
  EXPECT_EQ(brokenDown(0), "double 9x1 [2000 1 1 11 58 55 816 0 0]");
  EXPECT_EQ(brokenDown(536500869183999999), "double 9x1 [2016 12 31 23 59 60 999 999 999]");
}

TEST_F(Tt2000Test, FillAndPadValuesAreTwoDatesFarAway) {
  const Components fill{9999, 12, 31, 23, 59, 59, 999, 999, 999};
  const Components pad{0, 1, 1, 0, 0, 0, 0, 0, 0};
  EXPECT_EQ(computed(fill), shownTime(INT64_MIN));
  EXPECT_EQ(computed(pad), shownTime(INT64_MIN + 1));
  EXPECT_EQ(componentsOf(INT64_MIN), fill);
  EXPECT_EQ(componentsOf(INT64_MIN + 1), pad);
}

TEST_F(Tt2000Test, TheDayOfTheYearMayBeGivenWithMonthZeroOrOne) {
  const std::int64_t day45 = timeOf({2010, 2, 14, 0, 0, 0, 0, 0, 0});
  EXPECT_EQ(timeOf({2010, 0, 45, 0, 0, 0, 0, 0, 0}), day45);
  EXPECT_EQ(timeOf({2010, 1, 45, 0, 0, 0, 0, 0, 0}), day45);
}

TEST_F(Tt2000Test, DatesThatDoNotExistAreIllegal) {
  const Components times[] = {
      {2010, 2, 29, 0, 0, 0, 0, 0, 0},  {2010, 13, 1, 0, 0, 0, 0, 0, 0},
      {2010, 1e9, 1, 0, 0, 0, 0, 0, 0}, {2010, -1, 1, 0, 0, 0, 0, 0, 0},
      {2010, 2, 0, 0, 0, 0, 0, 0, 0},   {2010, 2, -999, 0, 0, 0, 0, 0, 0},
      {2010, 1, 366, 0, 0, 0, 0, 0, 0}, {2010, 1, 1, -1, 0, 0, 0, 0, 0},
      {2010, 1, 1, 0, 0, 0, 0, 0, -1},  {1707, 9, 21, 0, 0, 0, 0, 0, 0},
      {2300, 1, 1, 0, 0, 0, 0, 0, 0},   {-5, 1, 1, 0, 0, 0, 0, 0, 0},
      {0, 0, 0, 0, 0, 0, 0, 0, 0},      {NAN, NAN, NAN, NAN, NAN, NAN, NAN, NAN, NAN}};
  for (const Components& time : times)
    EXPECT_EQ(computed(time), kIllegal) << time[0] << ' ' << time[1] << ' ' << time[2];
}

TEST_F(Tt2000Test, TimesBeyond64BitsAreIllegal) {
  EXPECT_EQ(computed({2292, 4, 11, 11, 46, 7, 670, 775, 807}), shownTime(INT64_MAX));
  EXPECT_EQ(computed({2292, 4, 11, 11, 46, 7, 670, 775, 808}), kIllegal);
  EXPECT_EQ(computed({2292, 4, 11, 23, 0, 0, 0, 0, 0}), kIllegal);
  EXPECT_EQ(computed({1707, 9, 22, 12, 12, 10, 961, 224, 196}), shownTime(INT64_MIN + 4));
  EXPECT_EQ(computed({1707, 9, 22, 0, 0, 0, 0, 0, 0}), kIllegal);
}

TEST_F(Tt2000Test, EachLeapSecondOfTheLibraryIsASecondOfItsOwn) {
  const auto rows = leapSeconds();
  ASSERT_GE(rows.size(), 42U);
  for (std::size_t i = 15; i < rows.size(); ++i) {
    const auto [year, month, day, seconds, ignored, ignoredToo] = rows[i];
    const std::int64_t next = timeOf({year, month, day, 0, 0, 0, 0, 0, 0});
    const Components leap = componentsOf(next - 1);
    EXPECT_EQ(leap[5], 60) << year;
    EXPECT_EQ(timeOf(leap), next - 1) << year;
    EXPECT_EQ(componentsOf(next - kSecond - 1)[5], 59) << year;
    const std::int64_t seen = next - timeOf({year, month, day, 12, 0, 0, 0, 0, 0});
    EXPECT_EQ(seen, -43200 * kSecond) << year;
    EXPECT_EQ(seconds, rows[i - 1][3] + 1) << year;
  }
}

TEST_F(Tt2000Test, TheOffsetOfEachDayIsThatOfTheTable) {
  // Terrestrial time is 32.184 s ahead of the atomic time that the table counts.
  const std::int64_t noon2000 = timeOf({2000, 1, 1, 12, 0, 0, 0, 0, 0});
  EXPECT_EQ(noon2000, 32 * kSecond + kSecond + 31 * kSecond + 184000000);
  for (const auto& row : leapSeconds()) {
    if (row[0] < 1972) continue;
    const std::int64_t time = timeOf({row[0], row[1], row[2], 12, 0, 0, 0, 0, 0});
    const auto offset = static_cast<std::int64_t>(row[3]) * kSecond + 32184000000;
    EXPECT_EQ((time - offset) % (86400 * kSecond), 0) << row[0] << '-' << row[1];
  }
}

// Before 1972 the offset drifts with the day and is rounded to whole nanoseconds, as the library
// does it.
TEST_F(Tt2000Test, TimesAfter1972ComeBackExactly) {
  std::mt19937_64 generator(1);
  std::uniform_int_distribution<std::int64_t> any(-883655957816000000, INT64_MAX);
  for (int i = 0; i < 20000; ++i) {
    const std::int64_t time = any(generator);
    ASSERT_EQ(timeOf(componentsOf(time)), time);
  }
}

TEST_F(Tt2000Test, TimesBefore1960ComeBackExactly) {
  std::mt19937_64 generator(2);
  std::uniform_int_distribution<std::int64_t> any(INT64_MIN + 4, -1262400000000000000);
  for (int i = 0; i < 20000; ++i) {
    const std::int64_t time = any(generator);
    ASSERT_EQ(timeOf(componentsOf(time)), time);
  }
}

TEST_F(Tt2000Test, ManyTimesAreColumns) {
  const Given times = row<std::int64_t>({0, 536500868184000000});
  const Array columns = result("tt2000Breakdown", {times});
  EXPECT_THAT(columns.size(), testing::ElementsAre(9, 2));
  EXPECT_EQ(does("computeTT2000", {Array::of<double>(columns.data<double>(), {9, 2})}),
            "int64 1x2 [0 536500868184000000]");
}

}  // namespace
}  // namespace ambrix_test
