// Failures of the tool itself.
#pragma once

#include <stdexcept>
#include <string>

namespace ambrix::tool {

/// Something that cannot be done, with an identifier like those of the module's errors.
class ToolError : public std::runtime_error {
 public:
  ToolError(std::string identifier, const std::string& message)
      : std::runtime_error(message), identifier_("ambrix:" + std::move(identifier)) {}

  [[nodiscard]] const std::string& identifier() const noexcept { return identifier_; }

 private:
  std::string identifier_;
};

/// Arguments that the tool does not understand.
class UsageError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
};

inline constexpr int kExitFailure = 1;
inline constexpr int kExitUsage = 2;

}  // namespace ambrix::tool
