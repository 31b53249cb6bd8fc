// Where the values of a JSON text begin and end.
#pragma once

#include <cstddef>
#include <string_view>

namespace ambrix::tool {

/// Walks through a JSON text. Every member throws `JsonError` at what is not JSON.
class JsonScanner {
 public:
  explicit JsonScanner(std::string_view text) : text_(text) {}

  void skipBlanks();
  /// Passes one value, which nothing blank precedes, and returns its text.
  std::string_view takeValue(int depth = 0);
  std::string_view takeString();
  /// Passes a character if it comes next.
  bool take(char wanted);
  void expect(char wanted);
  [[nodiscard]] bool atEnd() const noexcept { return position_ == text_.size(); }
  /// Whether every number passed lies within the range of double.
  [[nodiscard]] bool numbersInRange() const noexcept { return numbersInRange_; }
  [[nodiscard]] std::string_view rest() const noexcept { return text_.substr(position_); }

 private:
  [[nodiscard]] char peek() const noexcept { return atEnd() ? '\0' : text_[position_]; }
  void skipList(int depth);
  void skipObject(int depth);
  void skipEscape();
  void skipNumber();
  void skipDigits();
  void skipWord(std::string_view word);

  std::string_view text_;
  std::size_t position_ = 0;
  bool numbersInRange_ = true;
};

}  // namespace ambrix::tool
