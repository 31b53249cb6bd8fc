#include "adapters/file/calendar_text.h"

#include <algorithm>
#include <chrono>
#include <cmath>
#include <cstdlib>
#include <optional>
#include <stdexcept>

namespace ambrix {
namespace {

constexpr std::size_t kSeconds = 5;          // the place of the seconds among the parts
constexpr std::size_t kFractionDigits = 12;  // three for each part behind the seconds

void appendPadded(std::string& text, double part, std::size_t width) {
  text.append(width, '0');
  auto rest = static_cast<int>(part);
  for (auto digit = text.rbegin(); rest > 0 && width > 0; ++digit, --width, rest /= 10)
    *digit = static_cast<char>('0' + rest % 10);
}

/// Takes fixed forms from the front of a text.
class Scanner {
 public:
  explicit Scanner(std::string_view text) : rest_(text) {}

  [[nodiscard]] bool atEnd() const { return rest_.empty(); }

  bool take(char wanted) {
    if (rest_.empty() || rest_.front() != wanted) return false;
    rest_.remove_prefix(1);
    return true;
  }

  /// Exactly so many digits.
  std::optional<double> number(std::size_t digits) {
    const std::string_view taken = rest_.substr(0, digits);
    if (taken.size() < digits || !std::ranges::all_of(taken, isDigit)) return std::nullopt;
    rest_.remove_prefix(digits);
    return std::strtod(std::string(taken).c_str(), nullptr);
  }

  /// All digits that follow, filled up with zeros.
  std::optional<std::string> fraction() {
    const auto end = std::ranges::find_if_not(rest_, isDigit);
    const auto count = static_cast<std::size_t>(end - rest_.begin());
    if (count == 0 || count > kFractionDigits) return std::nullopt;
    std::string digits(rest_.substr(0, count));
    rest_.remove_prefix(count);
    digits.resize(kFractionDigits, '0');
    return digits;
  }

 private:
  static bool isDigit(char c) { return c >= '0' && c <= '9'; }

  std::string_view rest_;
};

bool scanFraction(Scanner& scanner, CalendarTime& time) {
  const auto digits = scanner.fraction();
  if (!digits) return false;
  Scanner parts(*digits);
  for (std::size_t i = kSeconds + 1; i < time.parts.size(); ++i)
    time.parts[i] = *parts.number(3);
  return true;
}

bool scanParts(Scanner& scanner, CalendarTime& time) {
  struct Part {
    char separator;  // before it
    std::size_t digits;
  };
  constexpr std::array<Part, 6> kParts = {
      {{'\0', 4}, {'-', 2}, {'-', 2}, {'T', 2}, {':', 2}, {':', 2}}};
  constexpr std::array<std::size_t, 3> kEnds = {3, 5, 6};  // a text may end before these parts
  for (std::size_t i = 0; i < kParts.size(); ++i) {
    const bool mayEnd = std::ranges::find(kEnds, i) != kEnds.end();
    if (mayEnd && scanner.atEnd()) return true;
    const bool separated = i == 0 || scanner.take(kParts[i].separator) ||
                           (kParts[i].separator == 'T' && scanner.take(' '));
    const auto number = separated ? scanner.number(kParts[i].digits) : std::nullopt;
    if (!number) return false;
    time.parts[i] = *number;
  }
  return !scanner.take('.') || scanFraction(scanner, time);
}

/// The CDF library would count months beyond the twelfth into the next year.
bool isTime(const CalendarTime& time, bool leapSeconds) {
  const auto part = [&](std::size_t i) { return static_cast<unsigned>(time.parts[i]); };
  const std::chrono::year_month_day date(std::chrono::year(static_cast<int>(part(0))),
                                         std::chrono::month(part(1)), std::chrono::day(part(2)));
  const bool isLast = part(3) == 23 && part(4) == 59;
  const unsigned seconds = leapSeconds && isLast ? 61 : 60;
  return date.ok() && part(3) < 24 && part(4) < 60 && part(kSeconds) < seconds;
}

}  // namespace

std::string calendarText(std::span<const double> parts) {
  constexpr std::array<char, 6> kSeparators = {'-', '-', 'T', ':', ':', '.'};
  std::string text;
  text.reserve(sizeof "2004-05-13T15:08:11.022033044055");
  for (std::size_t i = 0; i < parts.size(); ++i) {
    const std::size_t width = i > kSeconds ? 3 : i == 0 ? 4 : 2;
    appendPadded(text, parts[i], width);
    if (i < kSeparators.size()) text += kSeparators[i];
  }
  return text;
}

CalendarTime parseCalendarTime(std::string_view text, bool leapSeconds) {
  CalendarTime time;
  if (text.empty()) return time;
  const std::string_view local = text.ends_with('Z') ? text.substr(0, text.size() - 1) : text;
  Scanner scanner(local);
  if (!scanParts(scanner, time) || !scanner.atEnd() || !isTime(time, leapSeconds))
    throwNoTime(text);
  return time;
}

bool isLeapSecond(const CalendarTime& time) {
  return time.parts[kSeconds] == 60;
}

void throwNoTime(std::string_view text) {
  throw std::invalid_argument("\"" + std::string(text) +
                              "\" is no time; expected one like 2004-05-13T15:08:11.022");
}

double picosecondsBelow(const CalendarTime& time, std::size_t firstPart) {
  double sum = 0;
  for (std::size_t i = std::max(firstPart, kSeconds + 1); i < time.parts.size(); ++i)
    sum += time.parts[i] * std::pow(1000, static_cast<double>(time.parts.size() - 1 - i));
  return sum;
}

}  // namespace ambrix
