// A progress bar for people who wait.
#pragma once

#include <chrono>
#include <cstddef>
#include <string>

namespace ambrix::tool {

/// A bar on standard error, which appears when the work takes a while and somebody watches, and
/// goes away with this object.
class Progress {
 public:
  Progress(std::string label, std::size_t total, bool watched);
  Progress(const Progress&) = delete;
  Progress& operator=(const Progress&) = delete;
  ~Progress();

  void advance(std::size_t amount);

 private:
  using Clock = std::chrono::steady_clock;
  void draw();

  std::string label_;
  std::size_t total_;
  std::size_t done_ = 0;
  bool watched_;
  bool drawn_ = false;
  Clock::time_point nextDraw_;
};

}  // namespace ambrix::tool
