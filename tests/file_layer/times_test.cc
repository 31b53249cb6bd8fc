// Datatypes, and times as texts and nanoseconds.
#include "tests/file_layer/file_layer_test.h"

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
  std::size_t supported = 0;
  for (const auto& facts : ::ambrix::datatypes()) {
    EXPECT_EQ(::ambrix::datatypeNamed(facts.name), facts.datatype);
    if (facts.classId == ClassId::kUnknown) continue;
    ++supported;
    std::string constant(facts.name);
    for (char& c : constant)
      c = static_cast<char>(std::toupper(c));
    EXPECT_EQ(::ambrix::constantValue(module, constant), static_cast<double>(facts.datatype));
    EXPECT_EQ(::ambrix::datatypeNamed(constant), facts.datatype);
  }
  EXPECT_EQ(supported, 15);
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
      timesAsNanoseconds(Array::row({k1970 * 1000, k2000 * 1000 + 1.5, k1970 * 1000 - 0.5, -1e31,
                                     0.0, std::numeric_limits<double>::quiet_NaN()}),
                         Datatype::kEpoch),
      ElementsAre(0, kDays * 86400 * kSecond + 1500000, -500000, kNoTime, kNoTime, kNoTime));
  EXPECT_THAT(timesAsNanoseconds(
                  Array::row({k2000, 1500.0, k1970 - 1, 999999999000.0, -1e31, -1e31, k2000, -5.0}),
                  Datatype::kEpoch16),
              ElementsAre(kDays * 86400 * kSecond + 2, -1, kNoTime, kNoTime));
  EXPECT_THROW(timesAsNanoseconds(Array::scalar(0.0), Datatype::kInt4), std::invalid_argument);
}

TEST_F(FileTimesTest, MakesTimesOfNanoseconds) {
  const std::vector<std::int64_t> times = {0, kDays * 86400 * kSecond + 1500000, -500000, kNoTime};
  const Array epochs = timesFromNanoseconds(times, Datatype::kEpoch);
  EXPECT_THAT(epochs.data<double>(),
              ElementsAre(k1970 * 1000, k2000 * 1000 + 1.5, k1970 * 1000 - 0.5, -1e31));
  EXPECT_EQ(timesAsNanoseconds(epochs, Datatype::kEpoch), times);
  const Array epochs16 = timesFromNanoseconds(times, Datatype::kEpoch16);
  EXPECT_THAT(epochs16.data<double>(),
              ElementsAre(k1970, 0, k2000, 1500000000, k1970 - 1, 999500000000, -1e31, -1e31));
  EXPECT_EQ(timesAsNanoseconds(epochs16, Datatype::kEpoch16), times);
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
