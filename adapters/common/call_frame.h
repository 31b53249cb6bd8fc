// One call of a module, from its start until everything it made is handed over or reclaimed.
#pragma once

#include <cstddef>

#include "adapters/common/tracked.h"

namespace ambrix {

/// While it lives, the thread is inside the module and what the module makes is tracked here; what
/// is left in the end is freed. Frames nest when a warning leads to another call.
class CallFrame {
 public:
  /// `extended`: whether the call may use the extended datatypes.
  explicit CallFrame(bool extended = false) noexcept;
  CallFrame(const CallFrame&) = delete;
  CallFrame& operator=(const CallFrame&) = delete;
  ~CallFrame();

  /// The innermost frame of this thread; null outside any call.
  static CallFrame* current() noexcept;

  [[nodiscard]] bool isExtended() const noexcept { return extended_; }
  void trackArray(Tracked& array) noexcept { arrays_.push_back(array); }
  void trackScratch(Tracked& buffer) noexcept { scratch_.push_back(buffer); }

  [[nodiscard]] std::size_t arrayCount() const noexcept { return arrays_.size(); }
  [[nodiscard]] std::size_t scratchCount() const noexcept { return scratch_.size(); }

 private:
  CallFrame* outer_;
  bool extended_;
  TrackedList arrays_;
  TrackedList scratch_;
};

/// Destroys an array that a call has left behind. Each host has its own.
void reclaimArray(Tracked& array) noexcept;

}  // namespace ambrix
