#include "adapters/file/time_kinds.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <stdexcept>

#include "ambrix/times.h"

namespace ambrix {
namespace {

constexpr double kEpochFill = -1e31;
constexpr std::int64_t kEpochOf1970 = 62167219200;  // seconds from the year 0 on
constexpr double kEndOfTime = 315569520000;         // the year 10000
constexpr double kLargestSpan = 9.3e9;              // seconds: nanoseconds cannot hold as many
constexpr std::int64_t kMillisecond = 1'000'000;
constexpr double kPicosecondsPerSecond = 1e12;

/// Comparisons with a number that is none are false.
bool isWithin(double value, double end) {
  return value >= 0 && value < end;
}

std::vector<bool> validEpochs(ArrayView times) {
  std::vector<bool> valid;
  for (const double value : times.data<double>())
    valid.push_back(isWithin(value, kEndOfTime * 1000));
  return valid;
}

/// All times that nanoseconds can hold are after the year 0, so that whole numbers are below.
std::int64_t nanosecondsOfEpoch(double value) {
  const double from1970 = value - static_cast<double>(kEpochOf1970 * 1000);
  if (!(std::abs(from1970) < kLargestSpan * 1000)) return kNoTime;
  const auto whole = static_cast<std::int64_t>(value);
  const double fraction = (value - static_cast<double>(whole)) * kMillisecond;
  return nanosecondsOf(whole - kEpochOf1970 * 1000, kMillisecond,
                       static_cast<std::int64_t>(fraction + 0.5));
}

std::int64_t nanosecondsOfEpoch16(double seconds, double picoseconds) {
  const double from1970 = seconds - static_cast<double>(kEpochOf1970);
  const bool isTime =
      std::abs(from1970) < kLargestSpan && isWithin(picoseconds, kPicosecondsPerSecond);
  if (!isTime) return kNoTime;
  const auto fraction = static_cast<std::int64_t>(picoseconds / 1000 + 0.5);
  return nanosecondsOf(static_cast<std::int64_t>(from1970), kSecond, fraction);
}

std::vector<std::int64_t> nanosecondsOfEpochs(Module* /*module*/, ArrayView times) {
  const std::span<const double> values = times.data<double>();
  std::vector<std::int64_t> nanoseconds(values.size());
  std::ranges::transform(values, nanoseconds.begin(), nanosecondsOfEpoch);
  return nanoseconds;
}

Array epochsOfNanoseconds(Module& /*module*/, std::span<const std::int64_t> times) {
  Array array = Array::uninitialized(ClassId::kDouble, {1, times.size()});
  std::ranges::transform(times, array.mutableData<double>().begin(), [](std::int64_t time) {
    const std::int64_t whole = time / kMillisecond;
    const auto fraction = static_cast<double>(time % kMillisecond) / kMillisecond;
    return time == kNoTime ? kEpochFill
                           : static_cast<double>(whole + kEpochOf1970 * 1000) + fraction;
  });
  return array;
}

void addToEpoch(Array& times, std::size_t index, double picoseconds) {
  times.mutableData<double>()[index] += picoseconds / 1e9;
}

void fillEpoch(Array& times, std::size_t index) {
  times.mutableData<double>()[index] = kEpochFill;
}

std::vector<bool> validEpochs16(ArrayView times) {
  const std::span<const double> values = times.data<double>();
  std::vector<bool> valid;
  for (std::size_t i = 0; i + 1 < values.size(); i += 2)
    valid.push_back(isWithin(values[i], kEndOfTime) &&
                    isWithin(values[i + 1], kPicosecondsPerSecond));
  return valid;
}

std::vector<std::int64_t> nanosecondsOfEpochs16(Module* /*module*/, ArrayView times) {
  const std::span<const double> values = times.data<double>();
  std::vector<std::int64_t> nanoseconds;
  nanoseconds.reserve(values.size() / 2);
  for (std::size_t i = 0; i + 1 < values.size(); i += 2)
    nanoseconds.push_back(nanosecondsOfEpoch16(values[i], values[i + 1]));
  return nanoseconds;
}

Array epochs16OfNanoseconds(Module& /*module*/, std::span<const std::int64_t> times) {
  Array array = Array::uninitialized(ClassId::kDouble, {2, times.size()});
  auto value = array.mutableData<double>().begin();
  for (const std::int64_t time : times) {
    const auto [seconds, fraction] = divided(time, kSecond);
    *value++ = time == kNoTime ? kEpochFill : static_cast<double>(seconds + kEpochOf1970);
    *value++ = time == kNoTime ? kEpochFill : static_cast<double>(fraction) * 1000;
  }
  return array;
}

void addToEpoch16(Array& times, std::size_t index, double picoseconds) {
  times.mutableData<double>()[2 * index + 1] += picoseconds;
}

void fillEpoch16(Array& times, std::size_t index) {
  const std::span<double> values = times.mutableData<double>();
  values[2 * index] = kEpochFill;
  values[2 * index + 1] = kEpochFill;
}

constexpr std::array<TimeKind, 2> kTimeKinds = {{
    {Datatype::kEpoch, "epochBreakdown", "computeEpoch", 7, validEpochs, nanosecondsOfEpochs,
     epochsOfNanoseconds, addToEpoch, fillEpoch},
    {Datatype::kEpoch16, "epoch16Breakdown", "computeEpoch16", 10, validEpochs16,
     nanosecondsOfEpochs16, epochs16OfNanoseconds, addToEpoch16, fillEpoch16},
}};

}  // namespace

const TimeKind& timeKindOf(Datatype datatype) {
  if (datatype == Datatype::kTimeTt2000) return kTt2000;
  const auto* const found = std::ranges::find(kTimeKinds, datatype, &TimeKind::datatype);
  if (found == kTimeKinds.end()) {
    throw std::invalid_argument("values of " + datatypeName(datatype) + " are no times here");
  }
  return *found;
}

}  // namespace ambrix
