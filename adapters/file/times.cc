#include "ambrix/times.h"

#include <cmath>
#include <stdexcept>

#include "adapters/file/calendar_text.h"
#include "adapters/file/time_kinds.h"

namespace ambrix {

std::vector<std::string> timesAsText(Module& module, ArrayView times, Datatype datatype) {
  const TimeKind& kind = timeKindOf(datatype);
  const std::vector<Array> broken = module.call(kind.breakdown, {times});
  const std::span<const double> parts = broken.at(0).data<double>();
  const std::vector<bool> valid = kind.valid(times);
  std::vector<std::string> texts(valid.size());
  for (std::size_t i = 0; i < valid.size(); ++i)
    if (valid[i]) texts[i] = calendarText(parts.subspan(kind.parts * i, kind.parts));
  return texts;
}

std::vector<std::int64_t> timesAsNanoseconds(Module& module, ArrayView times, Datatype datatype) {
  return timeKindOf(datatype).nanoseconds(&module, times);
}

std::vector<std::int64_t> timesAsNanoseconds(ArrayView times, Datatype datatype) {
  return timeKindOf(datatype).nanoseconds(nullptr, times);
}

Array timesFromNanoseconds(Module& module, std::span<const std::int64_t> times, Datatype datatype) {
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
  if (times.empty()) return kind.ofNanoseconds(module, {});
  Array values = std::move(module.call(kind.compute, {parts}).at(0));
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
