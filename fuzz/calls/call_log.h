// What a run has done so far. It lies in memory that a parent process can read after a crash.
#pragma once

#include <array>
#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace ambrix_fuzz {

inline constexpr std::size_t kMostCommands = 128;
inline constexpr std::size_t kMostErrors = 64;

struct CallLog {
  static constexpr std::size_t kLines = 24;
  static constexpr std::size_t kLineLength = 400;

  std::uint64_t calls = 0;
  std::uint64_t sequence = 0;
  std::uint64_t finished = 0;                            // sequences
  std::array<std::uint64_t, kMostCommands> succeeded{};  // by place in the table of commands
  std::array<std::uint64_t, kMostErrors> errors{};       // by place in the table of errors
  bool printing = false;                                 // each line at once, too

  void note(const std::string& line);
  /// What was noted last, oldest first.
  [[nodiscard]] std::vector<std::string> lastLines() const;

 private:
  std::uint64_t noted_ = 0;
  std::array<std::array<char, kLineLength>, kLines> lines_{};
};

/// The one of this process; a driver may put it elsewhere.
CallLog& callLog();
void setCallLog(CallLog& log);

/// Something has gone wrong: says so and ends the process like a crash.
[[noreturn]] void violation(const std::string& text);

}  // namespace ambrix_fuzz
