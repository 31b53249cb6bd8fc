// What a stream has consumed, kept so that another inflater can be given the same.
#pragma once

#include <cstddef>
#include <span>
#include <vector>

namespace ambrix::inflate {

using Bytes = std::span<const unsigned char>;

class ConsumedInput {
 public:
  /// More is not kept: what is compressed as one variable's records is much smaller.
  static constexpr std::size_t kMost = std::size_t{8} << 20;

  /// Keeps a copy; gives all up when that is too much or there is no memory.
  void append(Bytes input) noexcept;

  /// False once it has been given up.
  [[nodiscard]] bool complete() const noexcept { return complete_; }

  /// What has not been taken out again.
  [[nodiscard]] Bytes rest() const noexcept { return Bytes(bytes_).subspan(taken_); }
  void take(std::size_t count) noexcept { taken_ += count; }

 private:
  std::vector<unsigned char> bytes_;
  std::size_t taken_ = 0;
  bool complete_ = true;
};

}  // namespace ambrix::inflate
