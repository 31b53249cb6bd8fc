// Signals that wait until a piece of work is in order.
#pragma once

#include <csignal>

namespace ambrix::tool {

/// Whether the signal is one with which people and systems end programs.
bool isEndingSignal(int signal) noexcept;

/// Holds back the signals that would end this process, but those that are ignored, and those that
/// tell of children. What has come meanwhile takes effect when this object goes.
class HeldSignals {
 public:
  HeldSignals() noexcept;
  HeldSignals(const HeldSignals&) = delete;
  HeldSignals& operator=(const HeldSignals&) = delete;
  ~HeldSignals();

  [[nodiscard]] const sigset_t& all() const noexcept { return held_; }
  /// Takes them as usual from now on: for a child that goes ways of its own.
  void release() const noexcept;

 private:
  sigset_t held_;
  sigset_t before_;
};

}  // namespace ambrix::tool
