// Memory that ends where the process may not go on, for code that no sanitizer looks into.
#pragma once

#include <cstddef>

namespace ambrix_test {

class GuardedBytes {
 public:
  explicit GuardedBytes(std::size_t size);
  ~GuardedBytes();
  GuardedBytes(const GuardedBytes&) = delete;
  GuardedBytes& operator=(const GuardedBytes&) = delete;

  /// The last `size` bytes.
  [[nodiscard]] unsigned char* last(std::size_t size) const { return end_ - size; }

 private:
  void* start_;
  std::size_t mapped_;
  unsigned char* end_;
};

}  // namespace ambrix_test
