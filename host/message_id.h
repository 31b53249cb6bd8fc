// The record that errors and warnings share: which message it is, and the values that its text
// needs.
#pragma once

#include <cstdint>
#include <initializer_list>
#include <string>
#include <utility>
#include <variant>
#include <vector>

namespace TOLVEX::ambrix {

/// One message value: an integer, a narrow string or a UTF-16 string. A fresh one is the integer 0.
struct MessageArg : std::variant<std::int64_t, std::string, std::u16string> {
  using variant::variant;
  MessageArg(MessageArg&&) noexcept = default;
  MessageArg& operator=(MessageArg&&) noexcept = default;
  ~MessageArg() = default;

  // Texts are copied before they go into the variant: GCC's library destroys what is not there when
  // memory runs out while a variant of strings copies one into itself.
  MessageArg(const MessageArg& other)
      : variant(std::visit([](auto value) { return variant(std::move(value)); }, other)) {}
  MessageArg& operator=(const MessageArg& other) { return *this = MessageArg(other); }
};

/// An error or a warning as it travels from the module to its host, which owns the message texts.
struct MessageId {
  MessageId(std::string component_, std::string identifier_,
            std::initializer_list<MessageArg> values_ = {})
      : values(values_), component(std::move(component_)), identifier(std::move(identifier_)) {}

  /// What the user sees, for example "TOLVEX:ambrix:cdflib:libraryFailure".
  [[nodiscard]] std::string fullIdentifier() const { return component + ':' + identifier; }

  std::vector<MessageArg> values;
  std::string component;
  std::string identifier;
};

}  // namespace TOLVEX::ambrix
