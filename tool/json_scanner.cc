#include "tool/json_scanner.h"

#include <cmath>
#include <cstdlib>
#include <string>

#include "tool/json_text.h"

namespace ambrix::tool {
namespace {

constexpr std::string_view kEscapes = "\"\\/bfnrtu";

bool isDigit(char c) {
  return c >= '0' && c <= '9';
}

bool isHexDigit(char c) {
  return isDigit(c) || (c >= 'a' && c <= 'f') || (c >= 'A' && c <= 'F');
}

/// Whether a number can be a double: most are too short not to be.
bool isInRange(std::string_view number) {
  constexpr std::size_t kAlwaysInRange = 300;
  if (number.size() < kAlwaysInRange && number.find_first_of("eE") == std::string_view::npos) {
    return true;
  }
  return std::isfinite(std::strtod(std::string(number).c_str(), nullptr));
}

}  // namespace

void JsonScanner::skipBlanks() {
  const std::size_t next = text_.find_first_not_of(" \t\r\n", position_);
  position_ = next == std::string_view::npos ? text_.size() : next;
}

bool JsonScanner::take(char wanted) {
  if (atEnd() || text_[position_] != wanted) return false;
  ++position_;
  return true;
}

void JsonScanner::expect(char wanted) {
  if (take(wanted)) return;
  throw JsonError("expected '" + std::string(1, wanted) + "' at byte " +
                  std::to_string(position_ + 1));
}

std::string_view JsonScanner::takeValue(int depth) {
  if (depth > JsonView::kMaxDepth) throw JsonError("nested too deeply");
  const std::size_t start = position_;
  switch (peek()) {
    case '{':
      skipObject(depth);
      break;
    case '[':
      skipList(depth);
      break;
    case '"':
      takeString();
      break;
    case 't':
      skipWord("true");
      break;
    case 'f':
      skipWord("false");
      break;
    case 'n':
      skipWord("null");
      break;
    default:
      skipNumber();
  }
  return text_.substr(start, position_ - start);
}

void JsonScanner::skipList(int depth) {
  expect('[');
  skipBlanks();
  if (take(']')) return;
  do {
    skipBlanks();
    takeValue(depth + 1);
    skipBlanks();
  } while (take(','));
  expect(']');
}

void JsonScanner::skipObject(int depth) {
  expect('{');
  skipBlanks();
  if (take('}')) return;
  do {
    skipBlanks();
    takeString();
    skipBlanks();
    expect(':');
    skipBlanks();
    takeValue(depth + 1);
    skipBlanks();
  } while (take(','));
  expect('}');
}

std::string_view JsonScanner::takeString() {
  const std::size_t start = position_;
  expect('"');
  while (!take('"')) {
    if (static_cast<unsigned char>(peek()) < 0x20) throw JsonError("a string that does not end");
    if (take('\\')) {
      skipEscape();
    } else {
      ++position_;
    }
  }
  return text_.substr(start, position_ - start);
}

void JsonScanner::skipEscape() {
  const char kind = peek();
  if (kind == '\0' || kEscapes.find(kind) == std::string_view::npos) {
    throw JsonError("an escape that JSON does not have");
  }
  ++position_;
  if (kind != 'u') return;
  for (int digit = 0; digit < 4; ++digit) {
    if (!isHexDigit(peek())) throw JsonError("\\u needs four hexadecimal digits");
    ++position_;
  }
}

void JsonScanner::skipNumber() {
  const std::size_t start = position_;
  take('-');
  if (!take('0')) skipDigits();
  if (take('.')) skipDigits();
  if (take('e') || take('E')) {
    if (!take('+')) take('-');
    skipDigits();
  }
  numbersInRange_ = numbersInRange_ && isInRange(text_.substr(start, position_ - start));
}

void JsonScanner::skipDigits() {
  if (!isDigit(peek())) {
    throw JsonError("expected a JSON value or digit at byte " + std::to_string(position_ + 1));
  }
  while (isDigit(peek()))
    ++position_;
}

void JsonScanner::skipWord(std::string_view word) {
  if (!rest().starts_with(word)) {
    throw JsonError("expected a JSON value at byte " + std::to_string(position_ + 1));
  }
  position_ += word.size();
}

}  // namespace ambrix::tool
