// What a worker is at: it writes this into memory that it shares with the process watching it.
#pragma once

#include <array>
#include <atomic>
#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace ambrix::tool {

/// Says what begins now, "reading variable 3" for example. The clock of the time limit starts
/// anew. Without a watcher, none of what is here does anything.
void beginStep(std::string_view what);

/// The bytes that a worker may leave for its watcher.
inline constexpr std::size_t kRoomToTell = 1 << 18;

/// Leaves a line for the watcher, who finds it however the worker ends. When there is no room for
/// it and for as much more, it is only counted.
void tell(std::string_view line, std::size_t andFor = 0);

/// While one of these exists no time counts, because the worker waits for somebody else.
class Pause {
 public:
  Pause() noexcept;
  Pause(const Pause&) = delete;
  Pause& operator=(const Pause&) = delete;
  ~Pause();
};

/// The shared memory. The watcher reads the texts when the worker is gone.
class Steps {
 public:
  Steps();
  Steps(const Steps&) = delete;
  Steps& operator=(const Steps&) = delete;
  ~Steps();

  /// Makes this process the one that is watched.
  void adopt() const noexcept;
  /// Says that the work has been done to its end.
  void finish() const noexcept;

  [[nodiscard]] bool finished() const noexcept;
  [[nodiscard]] bool paused() const noexcept;
  /// How many steps have begun.
  [[nodiscard]] std::uint32_t count() const noexcept;
  [[nodiscard]] std::string last() const;
  [[nodiscard]] std::string told() const;
  /// How many lines found no room.
  [[nodiscard]] std::size_t untold() const noexcept;

  struct Memory {
    std::atomic<std::uint32_t> count;
    std::atomic<std::uint32_t> pauses;
    std::atomic<bool> finished;
    std::array<char, 1024> last;
    std::size_t toldBytes;
    std::array<char, kRoomToTell> told;
    std::size_t untold;
  };

 private:
  Memory* memory_;
};

}  // namespace ambrix::tool
