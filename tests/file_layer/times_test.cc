// Datatypes, and times as texts and nanoseconds.
#include "tests/file_layer/file_layer_test.h"
#include "tests/module/support/leak_check.h"

namespace ambrix_test {
namespace {

using ::ambrix::kNoTime;
using ::ambrix::timesAsNanoseconds;
using ::ambrix::timesAsText;
using ::ambrix::timesFromNanoseconds;
using ::ambrix::timesFromText;
using testing::ElementsAre;
using testing::IsEmpty;

class FileTimesTest : public FileLayerTest {
 protected:
  std::vector<std::string> texts(Array times, Datatype datatype) {
    return timesAsText(module, times, datatype);
  }
  Array of(std::vector<std::string> texts, Datatype datatype) {
    return timesFromText(module, texts, datatype);
  }
};

constexpr double k2000 = 63113904000;  // seconds from the year 0 to 2000
constexpr double k1970 = 62167219200;  // to 1970
constexpr std::int64_t kDays = 10957;  // from 1970 to 2000
constexpr std::int64_t kSecond = 1000000000;

TEST_F(FileTimesTest, KnowsTheDatatypesOfTheModule) {
  module.setExtended(true);
  std::size_t supported = 0;
  for (const auto& facts : ::ambrix::datatypes()) {
    EXPECT_EQ(::ambrix::datatypeNamed(facts.name), facts.datatype);
    ++supported;
    std::string constant(facts.name);
    for (char& c : constant)
      c = static_cast<char>(std::toupper(c));
    EXPECT_EQ(::ambrix::constantValue(module, constant), static_cast<double>(facts.datatype));
    EXPECT_EQ(::ambrix::datatypeNamed(constant), facts.datatype);
  }
  EXPECT_EQ(supported, 17);
  EXPECT_EQ(::ambrix::datatypeName(Datatype{99}), "datatype 99");
  EXPECT_EQ(::ambrix::datatypeNamed("cdf_int5"), std::nullopt);
  EXPECT_EQ(::ambrix::elementsPerValue(Datatype::kUchar, 7), 7);
  EXPECT_EQ(::ambrix::elementsPerValue(Datatype::kEpoch16, 1), 2);
  EXPECT_EQ(::ambrix::elementsPerValue(Datatype{99}, 1), 1);
}

TEST_F(FileTimesTest, WritesTimesAsCalendarTexts) {
  EXPECT_THAT(
      texts(Array::row({k2000 * 1000 + 1, 0.0, -1.0, -1e31, 315569520000000.0}), Datatype::kEpoch),
      ElementsAre("2000-01-01T00:00:00.001", "0000-01-01T00:00:00.000", "", "", ""));
  EXPECT_THAT(texts(Array::of(std::span<const double>(std::vector<double>{
                                  k2000 + 59, 123456789012, -1e31, -1e31, k2000, 1e12}),
                              {2, 3}),
                    Datatype::kEpoch16),
              ElementsAre("2000-01-01T00:00:59.123456789012", "", ""));
  EXPECT_THROW(texts(Array::scalar(0.0), Datatype::kReal8), std::invalid_argument);
}

TEST_F(FileTimesTest, CountsNanosecondsFrom1970) {
  EXPECT_THAT(
      timesAsNanoseconds(module,
                         Array::row({k1970 * 1000, k2000 * 1000 + 1.5, k1970 * 1000 - 0.5, -1e31,
                                     0.0, std::numeric_limits<double>::quiet_NaN()}),
                         Datatype::kEpoch),
      ElementsAre(0, kDays * 86400 * kSecond + 1500000, -500000, kNoTime, kNoTime, kNoTime));
  EXPECT_THAT(
      timesAsNanoseconds(
          module, Array::row({k2000, 1500.0, k1970 - 1, 999999999000.0, -1e31, -1e31, k2000, -5.0}),
          Datatype::kEpoch16),
      ElementsAre(kDays * 86400 * kSecond + 2, -1, kNoTime, kNoTime));
  EXPECT_THROW(timesAsNanoseconds(module, Array::scalar(0.0), Datatype::kInt4),
               std::invalid_argument);
  EXPECT_THAT(timesAsNanoseconds(Array::scalar(k1970 * 1000), Datatype::kEpoch), ElementsAre(0));
  EXPECT_THROW(timesAsNanoseconds(Array::scalar(std::int64_t{0}), Datatype::kTimeTt2000),
               std::invalid_argument);
}

TEST_F(FileTimesTest, ReachesAsFarAsNanosecondsDo) {
  constexpr double kLast = 9223372036;  // whole seconds
  EXPECT_THAT(
      timesAsNanoseconds(Array::row({(k1970 + kLast) * 1000 + 854, (k1970 + kLast) * 1000 + 855,
                                     (k1970 - kLast) * 1000 - 854, (k1970 - kLast) * 1000 - 855}),
                         Datatype::kEpoch),
      ElementsAre(9223372036854000000, kNoTime, -9223372036854000000, kNoTime));
  EXPECT_THAT(timesAsNanoseconds(Array::row({k1970 + kLast, 854775807000.0, k1970 + kLast,
                                             854775808000.0, k1970 - kLast - 1, 145224193000.0,
                                             k1970 - kLast - 1, 145224191000.0}),
                                 Datatype::kEpoch16),
              ElementsAre(INT64_MAX, kNoTime, -INT64_MAX, kNoTime));
  const std::vector<std::int64_t> ends = {INT64_MAX, -INT64_MAX};
  const Array epochs16 = timesFromNanoseconds(module, ends, Datatype::kEpoch16);
  EXPECT_EQ(timesAsNanoseconds(module, epochs16, Datatype::kEpoch16), ends);
  const LeaksIgnored libraryTable;  // of leap seconds
  EXPECT_EQ(errorOf([&] {
              timesFromNanoseconds(module, std::vector<std::int64_t>{-INT64_MAX},
                                   Datatype::kTimeTt2000);
            }),
            cdflib("illegalEpochValue"));
  const Array late = of({"2262-04-11T23:47:16.854775807"}, Datatype::kTimeTt2000);
  EXPECT_THAT(timesAsNanoseconds(module, late, Datatype::kTimeTt2000), ElementsAre(INT64_MAX));
}

TEST_F(FileTimesTest, MakesTimesOfNanoseconds) {
  const std::vector<std::int64_t> times = {0, kDays * 86400 * kSecond + 1500000, -500000, kNoTime};
  const Array epochs = timesFromNanoseconds(module, times, Datatype::kEpoch);
  EXPECT_THAT(epochs.data<double>(),
              ElementsAre(k1970 * 1000, k2000 * 1000 + 1.5, k1970 * 1000 - 0.5, -1e31));
  EXPECT_EQ(timesAsNanoseconds(module, epochs, Datatype::kEpoch), times);
  const Array epochs16 = timesFromNanoseconds(module, times, Datatype::kEpoch16);
  EXPECT_THAT(epochs16.data<double>(),
              ElementsAre(k1970, 0, k2000, 1500000000, k1970 - 1, 999500000000, -1e31, -1e31));
  EXPECT_EQ(timesAsNanoseconds(module, epochs16, Datatype::kEpoch16), times);
}

/// Nanoseconds from 2000-01-01T12:00:00 of terrestrial time, 64.184 seconds before that of UTC.
constexpr std::int64_t kNoon2000 = 64184000000;

TEST_F(FileTimesTest, KnowsLeapSeconds) {
  const LeaksIgnored libraryTable;  // of leap seconds
  const std::vector<std::string> given = {"2000-01-01T12:00:00.000000000",
                                          "2016-12-31T23:59:60.500000000",
                                          "2017-01-01T00:00:00.123456789", ""};
  const Array times = of(given, Datatype::kTimeTt2000);
  EXPECT_THAT(times.data<std::int64_t>(),
              ElementsAre(kNoon2000, 536500868684000000, 536500869307456789, INT64_MIN));
  EXPECT_EQ(texts(times.clone(), Datatype::kTimeTt2000), given);
  EXPECT_THAT(timesAsNanoseconds(module, times, Datatype::kTimeTt2000),
              ElementsAre(946728000 * kSecond, 1483228800 * kSecond + 500000000,
                          1483228800 * kSecond + 123456789, kNoTime));
}

TEST_F(FileTimesTest, CountsNanosecondsAlikeWithinAndAcrossLeapSeconds) {
  const LeaksIgnored libraryTable;  // of leap seconds
  const std::vector<std::int64_t> within = {1500000000 * kSecond + 5, 1500000001 * kSecond, kNoTime,
                                            1600000000 * kSecond};
  const std::vector<std::int64_t> across = {946684800 * kSecond, 1500000000 * kSecond + 7,
                                            1230768000 * kSecond, kNoTime};
  for (const auto& times : {within, across}) {
    const Array array = timesFromNanoseconds(module, times, Datatype::kTimeTt2000);
    EXPECT_EQ(timesAsNanoseconds(module, array, Datatype::kTimeTt2000), times);
  }
  // The years before 1972, when seconds of UTC had no fixed length, are told by the library.
  const Array early = of({"1965-03-01T00:00:00.000000001"}, Datatype::kTimeTt2000);
  EXPECT_THAT(timesAsNanoseconds(module, early, Datatype::kTimeTt2000),
              ElementsAre(-152668800 * kSecond + 1));
}

TEST_F(FileTimesTest, LeavesTheModuleAsStrictAsItWas) {
  const LeaksIgnored libraryTable;  // of leap seconds
  const Array time = of({"2016-12-31T23:59:60"}, Datatype::kTimeTt2000);
  EXPECT_EQ(errorOf([&] { module.call("tt2000Breakdown", {time}); }),
            cdflib("invalidOperation", "tt2000Breakdown"));
  EXPECT_EQ(errorOf([&] { texts(Array::scalar(1.0), Datatype::kTimeTt2000); }),
            cdflib("datatypeMismatch", "double", "CDF_TIME_TT2000"));
  EXPECT_FALSE(module.extended());
  module.setExtended(true);
  timesAsNanoseconds(module, time, Datatype::kTimeTt2000);
  EXPECT_TRUE(module.extended());
  EXPECT_THROW(timesAsNanoseconds(time, Datatype::kTimeTt2000), std::invalid_argument);
}

TEST_F(FileTimesTest, TellsTimesOfTt2000FromOtherValues) {
  const LeaksIgnored libraryTable;  // of leap seconds
  const Array values =
      rowOf<std::int64_t>({INT64_MIN, INT64_MIN + 1, INT64_MIN + 3, INT64_MIN + 4, INT64_MAX});
  EXPECT_THAT(
      texts(values.clone(), Datatype::kTimeTt2000),
      ElementsAre("", "", "", "1707-09-22T12:12:10.961224196", "2292-04-11T11:46:07.670775807"));
  EXPECT_THAT(timesAsNanoseconds(module, values, Datatype::kTimeTt2000),
              ElementsAre(kNoTime, kNoTime, kNoTime, -8276644069038775804, kNoTime));
  EXPECT_THAT(of({"1965-06-15T01:02:03.004005006789"}, Datatype::kTimeTt2000).data<std::int64_t>(),
              ElementsAre(-1090234640957376994));
  EXPECT_EQ(errorOf([&] { of({"1707-09-21"}, Datatype::kTimeTt2000); }),
            cdflib("illegalEpochValue"));
  // Leap seconds that there were not.
  for (const char* const text :
       {"2015-12-31T23:59:60", "2016-12-31T23:58:60", "2016-12-31T12:59:60"})
    EXPECT_THROW(of({text}, Datatype::kTimeTt2000), std::invalid_argument) << text;
}

TEST_F(FileTimesTest, ReadsCalendarTexts) {
  const Array epochs =
      of({"2000-01-01", "2000-01-01T00:00", "2000-01-01 00:00:01Z", "2000-01-01T00:00:00.0015", ""},
         Datatype::kEpoch);
  EXPECT_THAT(epochs.data<double>(), ElementsAre(k2000 * 1000, k2000 * 1000, k2000 * 1000 + 1000,
                                                 k2000 * 1000 + 1.5, -1e31));
  const Array epochs16 = of({"2000-01-01T00:00:59.123456789012", ""}, Datatype::kEpoch16);
  EXPECT_THAT(epochs16.data<double>(), ElementsAre(k2000 + 59, 123456789012, -1e31, -1e31));
  EXPECT_THAT(texts(epochs16.clone(), Datatype::kEpoch16),
              ElementsAre("2000-01-01T00:00:59.123456789012", ""));
  EXPECT_THAT(of({}, Datatype::kEpoch).data<double>(), IsEmpty());
}

TEST_F(FileTimesTest, RefusesWhatIsNoTime) {
  for (const char* const text :
       {"2000", "2000-01", "2000-1-1", "2000-01-01T", "2000-01-01T00", "2000-01-01T00:00:00.",
        "2000-01-01T00:00:00.1234567890123", "2000-01-01x", "2000-01-01T00:00:00.5+01:00", "Z",
        "2000-13-01", "2001-02-29", "2000-01-01T24:00", "2000-01-01T00:60", "2000-01-01T00:00:60"})
    EXPECT_THROW(of({text}, Datatype::kEpoch), std::invalid_argument) << text;
}

TEST_F(FileTimesTest, KeepsTimesOfAFile) {
  File file = create();
  const Variable variable = file.createVariable({.name = "t", .datatype = Datatype::kEpoch});
  const std::vector<std::string> given = {"2004-05-13T15:08:11.022", "1999-12-31T23:59:59.999"};
  file.write(variable, timesFromText(module, given, variable.datatype));
  file.close();
  File read = open();
  EXPECT_EQ(timesAsText(module, read.read(variable), variable.datatype), given);
}

}  // namespace
}  // namespace ambrix_test
