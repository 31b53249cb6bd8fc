// The datatypes of times: a row for each.
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

#include "ambrix/array.h"
#include "ambrix/datatype.h"
#include "ambrix/module.h"
#include "ambrix/times.h"

namespace ambrix {

/// What differs between datatypes of times.
struct TimeKind {
  Datatype datatype;
  const char* breakdown;  // the command that makes calendar times of the values of an array
  const char* compute;    // the one that makes values of calendar times
  /// The parts of a calendar time: year, month, day, hour, minute, second, millisecond, ...
  std::size_t parts;
  /// Whether each value is a time of the years 0 to 9999.
  std::vector<bool> (*valid)(ArrayView times);
  /// Without a module, throws std::invalid_argument when it takes one.
  std::vector<std::int64_t> (*nanoseconds)(Module* module, ArrayView times);
  Array (*ofNanoseconds)(Module& module, std::span<const std::int64_t> times);
  /// Adds what a calendar time has below its last part, in picoseconds.
  void (*addPicoseconds)(Array& times, std::size_t index, double picoseconds);
  /// Makes a value the usual fill value.
  void (*fill)(Array& times, std::size_t index);
};

inline constexpr std::int64_t kSecond = 1'000'000'000;  // in nanoseconds

/// A number as so many units and the rest, which is never negative.
struct Quotient {
  std::int64_t whole;
  std::int64_t rest;
};
constexpr Quotient divided(std::int64_t number, std::int64_t unit) {
  const std::int64_t rest = number % unit;
  const bool isBelow = rest < 0;
  return {number / unit - (isBelow ? 1 : 0), isBelow ? rest + unit : rest};
}

/// Units since 1970 and a rest of at most one unit, both in nanoseconds; `kNoTime` if 64 bits
/// cannot hold them.
inline std::int64_t nanosecondsOf(std::int64_t units, std::int64_t unit, std::int64_t rest) {
  if (units < 0) {  // the units alone may be beyond the limit
    ++units;
    rest -= unit;
  }
  std::int64_t product = 0;
  std::int64_t sum = 0;
  const bool isBeyond =
      __builtin_mul_overflow(units, unit, &product) || __builtin_add_overflow(product, rest, &sum);
  return isBeyond ? kNoTime : sum;
}

/// Times since 1970 whose days have 86,400 seconds, but in leap seconds.
extern const TimeKind kTt2000;

/// Throws std::invalid_argument for a datatype that has no row.
const TimeKind& timeKindOf(Datatype datatype);

}  // namespace ambrix
