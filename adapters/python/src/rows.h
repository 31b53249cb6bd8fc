// The commands as Python sees them.
#pragma once

#include <array>
#include <cstddef>
#include <span>

namespace ambrix::python {

/// How an argument is converted.
enum class ArgumentKind {
  kFile,       // an identifier
  kNumber,     // one number
  kNamed,      // one number, or the name of a constant
  kNumbers,    // a sequence of numbers
  kVariances,  // logicals or numbers
  kTimes,      // numbers; what has no datatype of its own is double
  kText,
  kFileName,
  kValue,  // values of exactly a datatype
};

/// How a result is converted.
enum class ResultKind {
  kIdentifier,
  kNumber,
  kText,
  kTexts,
  kFlag,
  kFlags,
  kNumbers,    // a tuple
  kParameter,  // nothing, a number or a text
  kValue,      // an array without its trailing sizes of 1; a single value is a scalar
  kRow,        // an array without the leading size of 1
  kBlock,      // an array with a dimension for each count and one for the records
  kArray,      // an array with the sizes of the module
};

struct Argument {
  const char* name = nullptr;
  ArgumentKind kind = ArgumentKind::kValue;
};

inline constexpr std::size_t kMostArguments = 9;
inline constexpr std::size_t kMostResults = 6;

struct Row {
  const char* name;
  std::size_t required;
  std::size_t argumentCount;
  std::array<Argument, kMostArguments> arguments;
  std::size_t resultCount;
  std::array<ResultKind, kMostResults> results;
  const char* doc;  // begins with the signature, as CPython wants it
};

inline constexpr Row kRows[] = {
#include "rows.inc"
};
inline constexpr std::size_t kRowCount = std::size(kRows);
static_assert(kRowCount == 91);

}  // namespace ambrix::python
