// What all commands on one attribute share.
#pragma once

#include "gateway/arguments.h"
#include "gateway/library_calls.h"

namespace TOLVEX::ambrix {

/// Kinds of entries as the library's entry routines number them. The third kind, 2, belongs to
/// variables that zVariable mode presents as zVariables, so no command addresses it.
inline constexpr int kGlobalEntry = 1;
inline constexpr int kVariableEntry = 3;

inline long getAttributeArg(const qvArray* argument, const char* label) {
  return variableOrAttributeNumber(getLongScalarArg(argument, label));
}

inline long getEntryArg(const qvArray* argument) {
  return libraryNumber(getLongScalarArg(argument, "ENTRYNUM"), kBadNumber);
}

}  // namespace TOLVEX::ambrix
