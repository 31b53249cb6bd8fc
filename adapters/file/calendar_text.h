// Calendar times in the form of ISO 8601.
#pragma once

#include <array>
#include <cstddef>
#include <span>
#include <string>
#include <string_view>

namespace ambrix {

/// Year, month, day, hour, minute, second, milli-, micro-, nano- and picosecond.
struct CalendarTime {
  std::array<double, 10> parts = {2000, 1, 1};
};

/// "2004-05-13T15:08:11.022", with three more digits for each part behind the millisecond.
std::string calendarText(std::span<const double> parts);

/// Throws std::invalid_argument. An empty text becomes some time. With leap seconds, a day may have
/// one at its end.
CalendarTime parseCalendarTime(std::string_view text, bool leapSeconds);

bool isLeapSecond(const CalendarTime& time);

[[noreturn]] void throwNoTime(std::string_view text);

/// The picoseconds in the parts from that one on.
double picosecondsBelow(const CalendarTime& time, std::size_t firstPart);

}  // namespace ambrix
