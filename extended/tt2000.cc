#include "extended/tt2000.h"

#include <algorithm>
#include <cmath>
#include <cstddef>
#include <span>

#include "epoch/time_components.h"
#include "extended/tt2000_routines.h"
#include "gateway/arguments.h"
#include "gateway/errors.h"
#include "gateway/raise_error.h"

namespace TOLVEX::ambrix {
namespace {

constexpr double kDay = 86400e9;  // in nanoseconds

/// The library takes a month of 0 with the day of the year.
bool isCalendarDate(const Tt2000Components& c) {
  return c[1] >= 0 && c[1] <= 12 && c[2] >= 1;
}

/// Roughly the time, without months of unequal lengths and leap seconds.
double approximateTime(const Tt2000Components& c) {
  const double days = (c[0] - 2000) * 365.2425 + c[1] * 30.4 + c[2];
  const double seconds = (c[3] * 60 + c[4]) * 60 + c[5];
  return days * kDay + seconds * 1e9 + c[6] * 1e6 + c[7] * 1e3 + c[8];
}

/// The library answers the fill and the pad value for two dates far away, and otherwise lets a time
/// that is too early or too late wrap around.
bool hasWrappedAround(const Tt2000Components& c, std::int64_t time) {
  constexpr std::int64_t kFillValue = INT64_MIN;
  constexpr std::int64_t kPadValue = INT64_MIN + 1;
  if ((c[0] == 9999 && time == kFillValue) || (c[0] == 0 && time == kPadValue)) return false;
  return std::abs(approximateTime(c) - static_cast<double>(time)) > 366 * kDay;
}

/// `kIllegalTt2000` for a time that does not exist or cannot be told in 64 bits.
std::int64_t timeOf(const Tt2000Components& components) {
  if (!isCalendarDate(components)) return kIllegalTt2000;
  const std::int64_t time = tt2000OfComponents(components);
  return hasWrappedAround(components, time) ? kIllegalTt2000 : time;
}

}  // namespace

void computeTt2000(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                   const CommandEntry*) {
  const std::size_t sizes[] = {1, requireGroups(arguments[0], kTt2000Components)};
  qvArray* times = qvCreateUninitNumericArray(2, sizes, qvINT64_CLASS, qvREAL);
  std::span<const double> components = componentsOf(arguments[0]);
  auto* time = static_cast<std::int64_t*>(qvGetData(times));
  for (; !components.empty(); components = components.subspan(kTt2000Components), ++time) {
    Tt2000Components whole;
    std::ranges::transform(components.first<kTt2000Components>(), whole.begin(), truncateToLong);
    *time = timeOf(whole);
    if (*time == kIllegalTt2000) raiseIllegalTime(components);
  }
  outputs[0] = times;
}

void tt2000Breakdown(int, qvArray* outputs[], std::int32_t, const qvArray* arguments[],
                     const CommandEntry*) {
  if (qvGetClassID(arguments[0]) != qvINT64_CLASS) {
    raiseError(cdflib::datatypeMismatch(qvGetClassName(arguments[0]), "CDF_TIME_TT2000"));
  }
  const std::size_t count = qvGetNumberOfElements(arguments[0]);
  const std::size_t sizes[] = {kTt2000Components, count};
  qvArray* broken = qvCreateUninitNumericArray(2, sizes, qvDOUBLE_CLASS, qvREAL);
  const auto* const times = static_cast<const std::int64_t*>(qvGetReadOnlyData(arguments[0]));
  auto* component = static_cast<double*>(qvGetData(broken));
  for (const std::int64_t time : std::span(times, count))
    component = std::ranges::copy(componentsOfTt2000(time), component).out;
  outputs[0] = broken;
}

}  // namespace TOLVEX::ambrix
