// Owners of memory from the host's allocator, released on every path.
#pragma once

#include <cstddef>
#include <memory>

#include "host/qv.h"

namespace TOLVEX::ambrix {

struct HostFree {
  void operator()(void* memory) const noexcept { qvFree(memory); }
};

/// The host's allocator for containers of bytes.
struct HostAllocator {
  using value_type = unsigned char;
  template <typename>
  struct rebind {
    using other = HostAllocator;
  };

  static value_type* allocate(std::size_t bytes) {
    return static_cast<value_type*>(qvMalloc(bytes));
  }
  static void deallocate(value_type* memory, std::size_t) noexcept { qvFree(memory); }
  friend bool operator==(HostAllocator, HostAllocator) { return true; }
};

/// A text that the host has allocated.
using HostString = std::unique_ptr<char, HostFree>;

/// Bytes for character data on their way through the library, which on some paths looks for a
/// terminator: one zero byte stands behind them.
class ScratchBuffer {
 public:
  explicit ScratchBuffer(std::size_t bytes) : memory_(static_cast<char*>(qvMalloc(bytes + 1))) {
    memory_.get()[bytes] = '\0';
  }
  [[nodiscard]] char* data() const noexcept { return memory_.get(); }

 private:
  std::unique_ptr<char, HostFree> memory_;
};

}  // namespace TOLVEX::ambrix
