// Conversion of host arrays into native arguments. Integers come as host doubles and are truncated
// toward zero; a value at or beyond plus or minus 2^63 throws Boost's overflow error, which the
// entry point reports as `argumentOutOfBounds`.
#pragma once

#include <string>
#include <vector>

#include "host/qv.h"

namespace TOLVEX::ambrix {

/// The one integer rule. NaN gives the most negative value.
long truncateToLong(double value);

/// Raises `argumentNotDoubleScalar` with the label unless the array is one double.
long getLongScalarArg(const qvArray* argument, const char* label);

/// All elements in storage order, of any numeric, logical or character array, by value. Raises
/// `argumentNotDoublePrecision` with the label for anything else.
std::vector<long> getLongVectorArg(const qvArray* argument, const char* label);

/// The low 8 bits of each character up to the first zero. A `std::logic_error` if the array is not
/// a character array.
std::string getStringArg(const qvArray* argument);

/// The text in the narrow encoding of file names. Raises `invalidCharError` for a character that
/// has no narrow form.
std::string getFilenameArg(const qvArray* argument);

}  // namespace TOLVEX::ambrix
