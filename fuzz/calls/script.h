// What the scripted library answers, decided before each call; how it treats memory is that of the
// CDF library: it reads and writes exactly as much as its own description of a variable says.
#pragma once

#include <cstddef>
#include <string>

#include "fuzz/calls/choices.h"
#include "fuzz/calls/world.h"
#include "tests/support/library_variable.h"

namespace ambrix_fuzz {

/// A variable as the library tells of it, which may be nonsense.
using Description = ambrix_test::LibraryVariable;

class Script {
 public:
  void begin(Choices& choices);
  void end() { choices_ = nullptr; }
  /// Decides on the next call of a command.
  void decide();

  [[nodiscard]] const Description& variable() const { return variable_; }
  [[nodiscard]] Variable hostVariable() const;

  /// The status that the next call of the library ends with.
  long nextStatus();
  /// Whether that call stops before it has answered anything.
  bool stopsEarly();
  /// A number that the library fills in under a name.
  long number(const std::string& item);
  std::string text(std::size_t most);
  long handle();
  double epoch();
  [[nodiscard]] Choices& choices() { return *choices_; }

  // Of the entry that was inquired last.
  long entryDatatype = 45;
  long entryElements = 1;

 private:
  void describeSanely();
  void describeOddly();
  long describedNumber(const std::string& item, bool& known) const;

  Choices* choices_ = nullptr;
  Description variable_;
  std::size_t callsToFailure_ = 0;
  long failure_ = 0;
};

Script& script();

/// How many bytes `values` values of the description take; more than can be counted is a violation.
std::size_t bytesOf(const Description& variable, long values);

/// Reads or writes memory as the library would, so that the sanitizers see whether it is there.
void readAll(const void* memory, std::size_t bytes);
void writeAll(void* memory, std::size_t bytes);

/// The library keeps 32 bits of a number: what is handed over must fit.
void requireFitting(long number);

}  // namespace ambrix_fuzz
