// `CDF_TIME_TT2000`: nanoseconds of terrestrial time, leap seconds included. The module knows them.
#include <algorithm>
#include <chrono>
#include <cstdint>
#include <limits>
#include <optional>
#include <stdexcept>
#include <utility>

#include "adapters/file/time_kinds.h"
#include "ambrix/times.h"

namespace ambrix {
namespace {

constexpr std::size_t kParts = 9;
constexpr std::int64_t kTt2000Fill = std::numeric_limits<std::int64_t>::min();
constexpr std::int64_t kDay = 86400 * kSecond;
/// From this time on, in nanoseconds since 2000, all seconds of UTC have been of one length.
constexpr std::int64_t kFrom1972 = -883655957'816'000'000;

bool isTime(std::int64_t value) {
  return value > kLargestTt2000Fill;
}

std::vector<bool> valid(ArrayView times) {
  std::vector<bool> valid;
  for (const std::int64_t value : times.data<std::int64_t>())
    valid.push_back(isTime(value));
  return valid;
}

/// Calendar time as nanoseconds since 1970.
std::int64_t nanosecondsFrom1970(std::span<const double> parts) {
  const auto part = [&](std::size_t i) { return static_cast<std::int64_t>(parts[i]); };
  const std::chrono::year_month_day date(std::chrono::year(static_cast<int>(part(0))),
                                         std::chrono::month(static_cast<unsigned>(part(1))),
                                         std::chrono::day(static_cast<unsigned>(part(2))));
  const std::int64_t days = std::chrono::sys_days(date).time_since_epoch().count();
  const std::int64_t seconds = ((days * 24 + part(3)) * 60 + part(4)) * 60 + part(5);
  return nanosecondsOf(seconds, kSecond, (part(6) * 1000 + part(7)) * 1000 + part(8));
}

std::vector<std::int64_t> brokenDown(Module& module, ArrayView times) {
  const std::vector<Array> broken = module.call("tt2000Breakdown", {times});
  const std::span<const double> parts = broken.at(0).data<double>();
  std::vector<std::int64_t> nanoseconds;
  nanoseconds.reserve(times.elementCount());
  for (const std::int64_t value : times.data<std::int64_t>()) {
    const auto own = parts.subspan(kParts * nanoseconds.size(), kParts);
    nanoseconds.push_back(isTime(value) ? nanosecondsFrom1970(own) : kNoTime);
  }
  return nanoseconds;
}

/// What is to be added to all these times, if it is the same: no leap second is among them.
std::optional<std::int64_t> commonOffset(Module& module, std::span<const std::int64_t> values) {
  std::int64_t first = std::numeric_limits<std::int64_t>::max();
  std::int64_t last = kTt2000Fill;
  for (const std::int64_t value : values) {
    if (!isTime(value)) continue;
    first = std::min(first, value);
    last = std::max(last, value);
  }
  if (first > last || first < kFrom1972) return std::nullopt;
  const std::vector<std::int64_t> ends = brokenDown(module, Array::row({first, last}));
  const bool isSame = ends[0] != kNoTime && ends[1] != kNoTime && ends[1] - ends[0] == last - first;
  return isSame ? std::optional(ends[0] - first) : std::nullopt;
}

/// Leap seconds are asked for once where there are none between the times.
std::vector<std::int64_t> nanoseconds(Module* module, ArrayView times) {
  if (module == nullptr) throw std::invalid_argument("leap seconds are known to the module only");
  const std::span<const std::int64_t> values = times.data<std::int64_t>();
  const auto offset = commonOffset(*module, values);
  if (!offset) return brokenDown(*module, times);
  std::vector<std::int64_t> nanoseconds(values.size());
  std::ranges::transform(values, nanoseconds.begin(), [&](std::int64_t value) {
    return isTime(value) ? value + *offset : kNoTime;
  });
  return nanoseconds;
}

void splitTime(std::int64_t time, std::span<double> parts) {
  const auto [day, sinceMidnight] = divided(time, kDay);
  const std::chrono::year_month_day date{std::chrono::sys_days(std::chrono::days(day))};
  const std::chrono::hh_mm_ss clock{std::chrono::nanoseconds(sinceMidnight)};
  const std::int64_t fraction = clock.subseconds().count();
  const double split[] = {static_cast<double>(static_cast<int>(date.year())),
                          static_cast<double>(static_cast<unsigned>(date.month())),
                          static_cast<double>(static_cast<unsigned>(date.day())),
                          static_cast<double>(clock.hours().count()),
                          static_cast<double>(clock.minutes().count()),
                          static_cast<double>(clock.seconds().count()),
                          static_cast<double>(fraction / 1'000'000),
                          static_cast<double>(fraction / 1000 % 1000),
                          static_cast<double>(fraction % 1000)};
  std::ranges::copy(split, parts.begin());
}

void fill(Array& times, std::size_t index) {
  times.mutableData<std::int64_t>()[index] = kTt2000Fill;
}

Array ofNanoseconds(Module& module, std::span<const std::int64_t> times) {
  Array parts = Array::zeros(ClassId::kDouble, {kParts, times.size()});
  const std::span<double> all = parts.mutableData<double>();
  for (std::size_t i = 0; i < times.size(); ++i)
    splitTime(times[i] == kNoTime ? 0 : times[i], all.subspan(kParts * i, kParts));
  Array values = std::move(module.call("computeTT2000", {parts}).at(0));
  for (std::size_t i = 0; i < times.size(); ++i)
    if (times[i] == kNoTime) fill(values, i);
  return values;
}

/// Nanoseconds are whole.
void addPicoseconds(Array& /*times*/, std::size_t /*index*/, double /*picoseconds*/) {}

}  // namespace

const TimeKind kTt2000 = {Datatype::kTimeTt2000, "tt2000Breakdown", "computeTT2000", kParts, valid,
                          nanoseconds,           ofNanoseconds,     addPicoseconds,  fill};

}  // namespace ambrix
