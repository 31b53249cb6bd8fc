// A call of a module, with what the module tells its host in it.
#pragma once

#include <functional>
#include <vector>

#include "adapters/common/call_frame.h"
#include "adapters/common/exported_interface.h"
#include "ambrix/error.h"
#include "ambrix/memory.h"

namespace ambrix {

/// What a module tells its host, apart from results and errors.
struct ModuleRecord {
  qvhExitHandler exitHandler = nullptr;
  std::function<void(const MessageId&)> warningHandler;
  std::vector<MessageId> warnings;  // those that no handler has taken
  bool unloading = false;
  bool extended = false;  // whether its calls may use the extended datatypes
  int depth = 0;          // calls under way
};

/// Every frame of this host is one of these.
class ModuleFrame : public CallFrame {
 public:
  explicit ModuleFrame(ModuleRecord& record) noexcept
      : CallFrame(record.extended), record_(record) {
    ++record_.depth;
  }
  ~ModuleFrame() { --record_.depth; }

  /// The module that this thread is in; null outside any call.
  static ModuleRecord* currentRecord() noexcept {
    CallFrame* const frame = current();
    return frame == nullptr ? nullptr : &static_cast<ModuleFrame*>(frame)->record_;
  }

  [[nodiscard]] LiveCounts remaining() const noexcept { return {arrayCount(), scratchCount()}; }

 private:
  ModuleRecord& record_;
};

}  // namespace ambrix
