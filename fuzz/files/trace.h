// Whose code a crash is in.
#pragma once

#include <string>

namespace ambrix::fuzz {

/// From now on a crash of this process prints its stack to standard error. The sanitizers do so
/// themselves.
void printStackOnCrash();

/// What a printed stack says, ours or a sanitizer's.
struct Blame {
  bool ours = false;   // the code that failed, or memory that was overrun, is not the library's
  bool known = false;  // whether there was a stack
  std::string place;   // "Function file:line" as far as it is known
};
Blame blameOf(const std::string& log);

}  // namespace ambrix::fuzz
