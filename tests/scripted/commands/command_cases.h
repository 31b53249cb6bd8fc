// One call of each command that succeeds, and what the library is asked on its way.
#pragma once

#include <ostream>
#include <string>
#include <vector>

#include "tests/support/scripted_test.h"

namespace ambrix_test {

struct CommandCase {
  std::string command;
  Arguments arguments;
  /// What a failure of each call of the library is reported as, in order: the routine, or an
  /// identifier of its own. Empty for the question of a guard, without whose answer the command
  /// goes on. Commands that look at no status have none.
  std::vector<std::string> reported;
  /// The place of an argument that is data and not a number, if any.
  std::size_t dataAt = 99;

  friend std::ostream& operator<<(std::ostream& out, const CommandCase& shown) {
    return out << shown.command;
  }
};

std::vector<CommandCase> commandCases();

/// What the first call reports that is not a guard's.
inline const std::string& firstReport(const CommandCase& given) {
  return given.reported[0].empty() ? given.reported[1] : given.reported[0];
}

/// How the failure reads.
inline std::string reportOf(const std::string& reported, long status) {
  return reported.starts_with("CDF") ? libraryFailure(reported, status) : cdflib(reported.c_str());
}

/// File 7 with its variable 3, which is 2 by 3 doubles, and its attribute 2 with an entry 5.
class CommandTest : public ScriptedTest {
 protected:
  CommandTest();
};

}  // namespace ambrix_test
