// Conversion of host arrays into native arguments. Integers come as host doubles and are truncated
// toward zero; a value at or beyond plus or minus 2^63 throws Boost's overflow error, which the
// entry point reports as `argumentOutOfBounds`.
#pragma once

#include <cmath>
#include <span>
#include <string>
#include <vector>

#include "host/qv.h"

namespace TOLVEX::ambrix {

/// Of this size on, a value is no long.
inline constexpr double kFirstTooLarge = 0x1p63;

/// The integer rule for a value that may be out of range or NaN.
long truncateUnusual(double value);

/// The one integer rule. NaN gives the most negative value.
inline long truncateToLong(double value) {
  if (std::abs(value) < kFirstTooLarge) [[likely]]
    return static_cast<long>(value);
  return truncateUnusual(value);
}

/// Throws for the first value that `truncateToLong` throws for.
void requireInRange(std::span<const double> values);

/// Raises `argumentNotDoubleScalar` with the label unless the array is one double.
long getLongScalarArg(const qvArray* argument, const char* label);

/// All elements in storage order, of any numeric, logical or character array, each taken as a
/// double (an integer of 64 bits is rounded to one); none of an empty array of whatever class.
/// Raises `argumentNotDoublePrecision` with the label for anything else.
std::vector<long> getLongVectorArg(const qvArray* argument, const char* label);

/// The low 8 bits of each character up to the first zero. A `std::logic_error` if the array is not
/// a character array.
std::string getStringArg(const qvArray* argument);

/// The text in the narrow encoding of file names. Raises `invalidCharError` for a character that
/// has no narrow form.
std::string getFilenameArg(const qvArray* argument);

}  // namespace TOLVEX::ambrix
