// The 91 commands, typed by hand: what they are called with, what they return, and what the library
// is asked on the way. Tests and fuzzers read them here; command_table_test.cc compares them with
// the module.
#pragma once

#include <cstddef>
#include <ostream>
#include <string>
#include <string_view>
#include <vector>

namespace ambrix_test {

/// How an argument is converted, and so which error one that cannot be converted raises.
enum class Conversion { kFile, kNumber, kNumbers, kText, kOwn };

struct Argument {
  std::string kind;
  /// Its name in errors; empty for those that no error names.
  std::string label;
  Conversion conversion = Conversion::kOwn;
  bool optional = false;
};

struct Command {
  int id = 0;
  std::string name;
  std::vector<Argument> arguments;
  /// A word for the kind of each result.
  std::vector<std::string> results;
  /// What a failure of each call of the library is reported as, in order: the routine, or an
  /// identifier of its own; "?" for the question of a guard, without whose answer the command goes
  /// on. Commands that look at no status have none.
  std::vector<std::string> reported;

  [[nodiscard]] std::size_t minimum() const;
  [[nodiscard]] std::size_t maximum() const { return arguments.size(); }
  [[nodiscard]] bool takesFile() const;

  friend std::ostream& operator<<(std::ostream& out, const Command& shown) {
    return out << shown.name;
  }
};

/// In the order of the module's table.
const std::vector<Command>& commands();

/// Those of hosts that offer extended datatypes.
const std::vector<Command>& extendedCommands();

/// The place of a command in the table, or behind it for an extended one; the number of all for a
/// name that is none.
std::size_t placeOf(std::string_view name);

}  // namespace ambrix_test
