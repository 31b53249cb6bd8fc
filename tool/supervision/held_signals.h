// Signals that wait until a piece of work is in order.
#pragma once

#include <csignal>

namespace ambrix::tool {

/// Whether a process that ends by the signal has crashed. Any other one but SIGKILL is somebody's
/// wish.
bool isCrash(int signal) noexcept;

/// Holds back every signal that would end this process, and those that tell of children. What has
/// come meanwhile takes effect when this object goes.
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
