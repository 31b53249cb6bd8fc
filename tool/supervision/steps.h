// The steps of a worker, the process that reads a file, in memory that it shares with its watcher.
#pragma once

#include <array>
#include <atomic>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace ambrix::tool {

/// Names the step that begins, such as "reading variable 3", and restarts the clock of the time
/// limit. Without a watcher the functions here do nothing.
void beginStep(std::string_view what);

/// The bytes of all reports of a worker.
inline constexpr std::size_t kRoomForReports = 1 << 18;

/// Leaves a line for the watcher, also if the worker crashes later. The line is only counted if
/// fewer than `spare` bytes would remain.
void report(std::string_view line, std::size_t spare = 0);

/// Stops the clock of the time limit while it exists, because the worker waits for another process.
class Pause {
 public:
  Pause() noexcept;
  Pause(const Pause&) = delete;
  Pause& operator=(const Pause&) = delete;
  ~Pause();
};

/// The shared memory. The watcher reads the texts after the worker has ended.
class Steps {
 public:
  Steps();
  Steps(const Steps&) = delete;
  Steps& operator=(const Steps&) = delete;
  ~Steps();

  /// Makes this process the watched one.
  void adopt() const noexcept;
  /// Marks the work as complete.
  void finish() const noexcept;

  [[nodiscard]] bool finished() const noexcept;
  [[nodiscard]] bool paused() const noexcept;
  /// The number of steps begun.
  [[nodiscard]] std::uint32_t count() const noexcept;
  [[nodiscard]] std::string last() const;
  [[nodiscard]] std::string reports() const;
  /// The number of lines for which there was no room.
  [[nodiscard]] std::size_t unreported() const noexcept;

  struct Memory {
    std::atomic<std::uint32_t> count;
    std::atomic<std::uint32_t> pauses;
    std::atomic<bool> finished;
    std::array<char, 1024> last;
    std::size_t reportBytes;
    std::array<char, kRoomForReports> reports;
    std::size_t unreported;
  };

 private:
  Memory* memory_;
};

}  // namespace ambrix::tool
