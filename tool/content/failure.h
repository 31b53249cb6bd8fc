// Failures of the tool itself.
#pragma once

#include <stdexcept>
#include <string>
#include <utility>

namespace ambrix::tool {

/// Something that cannot be done, with an identifier like those of the module's errors.
class ToolError : public std::runtime_error {
 public:
  ToolError(std::string identifier, const std::string& message)
      : std::runtime_error(message), identifier_("ambrix:" + std::move(identifier)) {}

  [[nodiscard]] const std::string& identifier() const noexcept { return identifier_; }

 protected:
  struct Whole {};  // the identifier is taken as it is
  ToolError(Whole, std::string identifier, const std::string& message)
      : std::runtime_error(message), identifier_(std::move(identifier)) {}

 private:
  std::string identifier_;
};

/// A file that cannot be opened: the module's error, with the cause as its text.
class OpenError : public ToolError {
 public:
  explicit OpenError(const std::string& cause)
      : ToolError(Whole(), "TOLVEX:ambrix:cdflib:fileOpenError", cause) {}
};

/// Any error, told of the file whose name is put before its text.
class NamedError : public ToolError {
 public:
  NamedError(const std::string& file, std::string identifier, const std::string& message)
      : ToolError(Whole(), std::move(identifier), file + ": " + message) {}
};

/// Arguments that the tool does not understand.
class UsageError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

inline constexpr int kExitFailure = 1;
inline constexpr int kExitUsage = 2;
inline constexpr int kExitUndecided = 3;  // of a check

}  // namespace ambrix::tool
