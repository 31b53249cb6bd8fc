// What is checked of arrays.
#pragma once

#include <string>

namespace probe {

/// What a check has found wrong.
class Findings {
 public:
  void expect(bool holds, const std::string& what) {
    if (!holds) text_ += (text_.empty() ? "" : "; ") + what;
  }
  [[nodiscard]] const std::string& text() const { return text_; }

 private:
  std::string text_;
};

// The checks. Each says in its name what holds in a host that conforms.
void sizesFollowTheRules(Findings& findings);
void numbersHaveTheirClass(Findings& findings);
void unsetNumbersCanBeWritten(Findings& findings);
void logicalsAreBytes(Findings& findings);
void charactersHave16Bits(Findings& findings);
void scalarsKeepTheirValue(Findings& findings);
void accessorsOfOtherClassesGiveNull(Findings& findings);
void cellsHoldArrays(Findings& findings);
void onlyRealNumbersAreNumeric(Findings& findings);

}  // namespace probe
