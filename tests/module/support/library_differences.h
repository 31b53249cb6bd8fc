// Everything in which the versions of the CDF library differ to these tests.
#pragma once

#include <string>

namespace ambrix_test {

class LibraryDifferences {
 public:
  /// Version 3.9.1 is 391.
  explicit LibraryDifferences(int version) : old_(version < 390) {}

  /// What is read in place of n characters from a zero on, as `shown`: it ends a text, and the old
  /// library fills up with blanks.
  [[nodiscard]] std::string behindZero(int n) const {
    std::string text;
    while (n-- > 0)
      text += old_ ? " " : "\\x0";
    return text;
  }
  /// Whether the fill value of a variable stands in for a record that does not vary and was never
  /// written, in a file of the format of version 2.
  [[nodiscard]] bool fillsUnwrittenRecords() const { return !old_; }
  /// Whether an attribute entry may be a text without characters.
  [[nodiscard]] bool hasEmptyTextEntries() const { return !old_; }

 private:
  bool old_;
};

}  // namespace ambrix_test
