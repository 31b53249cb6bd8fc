// Times in arrays, as calendar texts and as nanoseconds.
#pragma once

#include <cstdint>
#include <limits>
#include <span>
#include <string>
#include <vector>

#include "ambrix/array.h"
#include "ambrix/datatype.h"
#include "ambrix/export.h"
#include "ambrix/module.h"

namespace ambrix {

/// Stands for a value that is no time, such as a fill value, or that 64 bits of nanoseconds since
/// 1970 cannot hold: they reach from 1677 to 2262. It is NumPy's "not a time".
inline constexpr std::int64_t kNoTime = std::numeric_limits<std::int64_t>::min();

/// Values of `CDF_TIME_TT2000` up to this one are no times, but fill values, pad values and the
/// like.
inline constexpr std::int64_t kLargestTt2000Fill = std::numeric_limits<std::int64_t>::min() + 3;

/// The times in an array of a datatype as ISO 8601, such as "2004-05-13T15:08:11.022": in
/// milliseconds, those of `CDF_TIME_TT2000` in nanoseconds, and those of `CDF_EPOCH16` in
/// picoseconds. The text is empty where the value is no time of the years 0 to 9999, as fill
/// values, and the pad value that the library has for `CDF_TIME_TT2000`. Throws
/// std::invalid_argument for a datatype without times.
AMBRIX_EXPORT std::vector<std::string> timesAsText(Module& module, ArrayView times,
                                                   Datatype datatype);

/// The same as nanoseconds since 1970-01-01T00:00:00, each rounded to the nearest one; `kNoTime`
/// where there is none. Days have 86,400 seconds: a leap second, which only `CDF_TIME_TT2000` tells
/// apart, is the first of the next day.
AMBRIX_EXPORT std::vector<std::int64_t> timesAsNanoseconds(Module& module, ArrayView times,
                                                           Datatype datatype);
/// The same without a module, for `CDF_EPOCH` and `CDF_EPOCH16`. May be called from any thread.
AMBRIX_EXPORT std::vector<std::int64_t> timesAsNanoseconds(ArrayView times, Datatype datatype);

/// The array of a datatype with these times, one record each. Today's times of `CDF_EPOCH` are
/// multiples of 1/128 millisecond. `kNoTime` becomes the usual fill value: -1e31, or the least
/// number of `CDF_TIME_TT2000`. The module raises `illegalEpochValue` for times before 1707-09-22,
/// where TT2000 begins.
AMBRIX_EXPORT Array timesFromNanoseconds(Module& module, std::span<const std::int64_t> times,
                                         Datatype datatype);

/// The same from ISO 8601: a date, or date and time with up to twelve digits behind the second, and
/// "Z" or nothing. `CDF_TIME_TT2000` takes leap seconds, and drops digits below the nanosecond. An
/// empty text becomes the fill value. Throws std::invalid_argument for a text that is no time; the
/// module raises `illegalEpochValue` for one beyond the years 1707 to 2292 of TT2000.
AMBRIX_EXPORT Array timesFromText(Module& module, std::span<const std::string> times,
                                  Datatype datatype);

}  // namespace ambrix
