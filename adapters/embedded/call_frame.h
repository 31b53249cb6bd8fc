// One call of a module, from its start until everything it made is handed over or reclaimed.
#pragma once

#include <cstddef>
#include <functional>
#include <vector>

#include "adapters/embedded/array_object.h"
#include "adapters/embedded/tracked_list.h"
#include "ambrix/error.h"
#include "ambrix/memory.h"

namespace ambrix {

/// What a module tells its host, apart from results and errors.
struct ModuleRecord {
  qvhExitHandler exitHandler = nullptr;
  std::function<void(const MessageId&)> warningHandler;
  std::vector<MessageId> warnings;  // those that no handler has taken
  bool unloading = false;
  int depth = 0;  // calls under way
};

/// While it lives, the thread is inside the module and what the module makes is tracked here; what
/// is left in the end is freed. Frames nest when a warning handler calls a module.
class CallFrame {
 public:
  explicit CallFrame(ModuleRecord& record) noexcept;
  CallFrame(const CallFrame&) = delete;
  CallFrame& operator=(const CallFrame&) = delete;
  ~CallFrame();

  /// The innermost frame of this thread; null outside any call.
  static CallFrame* current() noexcept;

  [[nodiscard]] ModuleRecord& record() const noexcept { return record_; }
  void trackArray(qvArray& array) noexcept { arrays_.add(array.place); }
  void trackScratch(Tracked& buffer) noexcept { scratch_.add(buffer); }

  [[nodiscard]] bool holds(const qvArray& array) const noexcept {
    return array.place.list == &arrays_;
  }
  [[nodiscard]] LiveCounts remaining() const noexcept { return {arrays_.size(), scratch_.size()}; }

 private:
  ModuleRecord& record_;
  CallFrame* outer_;
  TrackedList arrays_;
  TrackedList scratch_;
};

}  // namespace ambrix
