#include "ambrix/times.h"

#include <algorithm>

#include "adapters/file/calendar_text.h"
#include "adapters/file/extended_calls.h"
#include "adapters/file/time_kinds.h"

namespace ambrix {
namespace {

/// The module counts a second 60 that there was not into the next day.
void requireLeapSeconds(Module& module, const TimeKind& kind, ArrayView values,
                        std::span<const std::string> texts, std::span<const CalendarTime> read) {
  if (std::ranges::none_of(read, isLeapSecond)) return;
  const std::vector<Array> broken = module.call(kind.breakdown, {values});
  const std::span<const double> parts = broken.at(0).data<double>();
  for (std::size_t i = 0; i < read.size(); ++i) {
    const bool stays = std::ranges::equal(parts.subspan(kind.parts * i, kind.parts),
                                          std::span(read[i].parts).first(kind.parts));
    if (isLeapSecond(read[i]) && !stays) throwNoTime(texts[i]);
  }
}

}  // namespace

std::vector<std::string> timesAsText(Module& module, ArrayView times, Datatype datatype) {
  const TimeKind& kind = timeKindOf(datatype);
  const ExtendedCalls extended(module);
  const std::vector<Array> broken = module.call(kind.breakdown, {times});
  const std::span<const double> parts = broken.at(0).data<double>();
  const std::vector<bool> valid = kind.valid(times);
  std::vector<std::string> texts(valid.size());
  for (std::size_t i = 0; i < valid.size(); ++i)
    if (valid[i]) texts[i] = calendarText(parts.subspan(kind.parts * i, kind.parts));
  return texts;
}

std::vector<std::int64_t> timesAsNanoseconds(Module& module, ArrayView times, Datatype datatype) {
  const ExtendedCalls extended(module);
  return timeKindOf(datatype).nanoseconds(&module, times);
}

std::vector<std::int64_t> timesAsNanoseconds(ArrayView times, Datatype datatype) {
  return timeKindOf(datatype).nanoseconds(nullptr, times);
}

Array timesFromNanoseconds(Module& module, std::span<const std::int64_t> times, Datatype datatype) {
  const ExtendedCalls extended(module);
  return timeKindOf(datatype).ofNanoseconds(module, times);
}

Array timesFromText(Module& module, std::span<const std::string> times, Datatype datatype) {
  const TimeKind& kind = timeKindOf(datatype);
  Array parts = Array::zeros(ClassId::kDouble, {kind.parts, times.size()});
  std::vector<CalendarTime> read;
  for (const std::string& text : times) {
    read.push_back(parseCalendarTime(text, datatype == Datatype::kTimeTt2000));
    const auto own = parts.mutableData<double>().subspan(kind.parts * (read.size() - 1));
    for (std::size_t i = 0; i < kind.parts; ++i)
      own[i] = read.back().parts[i];
  }
  const ExtendedCalls extended(module);
  if (times.empty()) return kind.ofNanoseconds(module, {});
  Array values = std::move(module.call(kind.compute, {parts}).at(0));
  requireLeapSeconds(module, kind, values, times, read);
  for (std::size_t i = 0; i < read.size(); ++i) {
    if (times[i].empty()) {
      kind.fill(values, i);
    } else {
      kind.addPicoseconds(values, i, picosecondsBelow(read[i], kind.parts));
    }
  }
  return values;
}

}  // namespace ambrix
