// Arrays to call commands with: sound ones of a class, and any that a host could hand over.
#pragma once

#include <ambrix/embedded.h>

#include <iterator>
#include <string>
#include <string_view>

#include "fuzz/calls/choices.h"
#include "tests/support/datatypes.h"

namespace ambrix_fuzz {

using ambrix::Array;
using ambrix::ArrayView;
using ambrix::ClassId;

/// A number from the places where conversions and 32-bit fields break.
double anyNumber(Choices& choices);
/// Any class that arrays have, any of some shapes, content of every kind.
Array anyArray(Choices& choices);
/// Texts that are empty, long, not ASCII or have zeros inside; without a slash, so that no file
/// name leads out of the current folder.
std::u16string anyText(Choices& choices);

/// A row of values, the first of them of any kind.
Array valuesOf(Choices& choices, ClassId classId, std::size_t count);

/// In the order in which they are chosen from.
inline constexpr long kDatatypeCodes[] = {22, 4, 51, 32, 1, 2, 11, 12, 14, 21, 31, 41, 44, 45, 52};
static_assert(std::size(kDatatypeCodes) == std::size(ambrix_test::kCdfDatatypes));

/// One of these, and now and then one that only extended hosts know.
long anyDatatype(Choices& choices);

/// The class of a supported datatype; kUnknown for others. And the bytes of one element.
ClassId classOfDatatype(long datatype);
std::size_t bytesOfDatatype(long datatype);
bool isText(long datatype);
/// The datatype that an inquiry names, such as "cdf_int4"; 0 for others.
long datatypeOfName(std::string_view name);

/// The array in a few words, for the log of calls.
std::string shown(ArrayView array);

}  // namespace ambrix_fuzz
