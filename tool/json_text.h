// JSON as it stands in a line of text: checked once as a whole, then read where it lies.
#pragma once

#include <cstdint>
#include <optional>
#include <stdexcept>
#include <string>
#include <string_view>

namespace ambrix::tool {

/// A text that is not JSON, or JSON that is not what was asked for.
class JsonError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

enum class JsonKind { kNull, kTrue, kFalse, kNumber, kString, kList, kObject };

/// A value inside a checked text, which must outlive it.
class JsonView {
 public:
  /// Checks a text: one JSON value in valid UTF-8, with no deeper nesting than `kMaxDepth`. A
  /// surrogate that is escaped on its own is accepted. Throws `JsonError`.
  ///
  /// Numbers beyond the range of double are JSON, too; whether there is none is told apart.
  static JsonView check(std::string_view text, bool& numbersInRange);
  static constexpr int kMaxDepth = 512;

  [[nodiscard]] JsonKind kind() const noexcept;
  /// The value as it is written.
  [[nodiscard]] std::string_view source() const noexcept { return source_; }

  /// The UTF-16 units of a string. Throws `JsonError` for any other value.
  [[nodiscard]] std::u16string string() const;
  /// A number. Throws `JsonError` for any other value and beyond the range of the type; a number
  /// with a point or an exponent is no integer.
  [[nodiscard]] double toDouble() const;
  [[nodiscard]] float toSingle() const;
  [[nodiscard]] std::int64_t toInt64() const;
  [[nodiscard]] std::uint64_t toUint64() const;
  /// A number written without sign, point and exponent.
  [[nodiscard]] bool isCount() const noexcept;

 private:
  friend class JsonItems;
  friend class JsonMembers;
  explicit JsonView(std::string_view source) : source_(source) {}
  std::string_view source_;
};

/// The items of a list, one after the other. Making it throws `JsonError` for any other value.
class JsonItems {
 public:
  explicit JsonItems(JsonView list);
  std::optional<JsonView> next();

 private:
  std::string_view rest_;
};

/// The members of an object, as they are written.
class JsonMembers {
 public:
  struct Member {
    std::u16string key;
    JsonView value;
  };
  explicit JsonMembers(JsonView object);
  std::optional<Member> next();

 private:
  std::string_view rest_;
};

/// The member of that name, if there is one. Throws `JsonError` when there are several.
std::optional<JsonView> findMember(JsonView object, std::u16string_view key);

}  // namespace ambrix::tool
