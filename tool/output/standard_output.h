// Standard output, which belongs to the tool alone.
#pragma once

#include <stdexcept>
#include <string>
#include <string_view>

namespace ambrix::tool {

/// Nobody reads standard output any more.
class OutputClosed : public std::runtime_error {
 public:
  OutputClosed() : std::runtime_error("standard output is closed") {}
};

/// Takes standard output over: what libraries print to it from now on goes to standard error.
/// There is one of these, made before anything is opened.
class StandardOutput {
 public:
  StandardOutput();
  StandardOutput(const StandardOutput&) = delete;
  StandardOutput& operator=(const StandardOutput&) = delete;

  /// Writes all of it, through a buffer. Throws `OutputClosed`, and std::system_error when the
  /// output cannot be written, a full disk for example.
  void write(std::string_view text);
  /// From now on writes to a new file in place of standard output; errors call it by the name.
  void redirect(const std::string& path, const std::string& name);
  void flush();
  [[nodiscard]] bool isTerminal() const noexcept;

 private:
  void writeNow(std::string_view text);

  int descriptor_;
  std::string name_ = "standard output";
  std::string buffer_;
};

/// Whether standard error is a terminal.
bool errorIsTerminal() noexcept;

}  // namespace ambrix::tool
