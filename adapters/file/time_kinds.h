// The datatypes of times: a row for each.
#pragma once

#include <cstddef>
#include <cstdint>
#include <span>
#include <vector>

#include "ambrix/array.h"
#include "ambrix/datatype.h"
#include "ambrix/module.h"

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

/// Times since 1970 whose days have 86,400 seconds, but in leap seconds.
extern const TimeKind kTt2000;

/// Throws std::invalid_argument for a datatype that has no row.
const TimeKind& timeKindOf(Datatype datatype);

}  // namespace ambrix
