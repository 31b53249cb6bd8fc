// The one source of chance: a string of bytes, from a generator or from libFuzzer. Equal bytes make
// equal sequences of calls.
#pragma once

#include <cstddef>
#include <cstdint>
#include <iterator>
#include <span>

namespace ambrix_fuzz {

/// Bytes that are used up answer with zeros, which stand for the ordinary choice everywhere.
class Choices {
 public:
  explicit Choices(std::span<const std::uint8_t> bytes) : bytes_(bytes) {}

  [[nodiscard]] bool usedUp() const { return next_ >= bytes_.size(); }

  std::uint8_t byte() { return usedUp() ? std::uint8_t{0} : bytes_[next_++]; }

  std::uint64_t word() {
    std::uint64_t all = 0;
    for (int i = 0; i < 8; ++i)
      all = all << 8 | byte();
    return all;
  }

  /// One of 0 to n-1, for n up to 65536.
  std::size_t below(std::size_t n) {
    const std::size_t low = byte();
    return (n <= 256 ? low : low << 8 | byte()) % n;
  }

  bool oneIn(std::size_t n) { return below(n) == n - 1; }

  template <typename Table>
  const auto& pick(const Table& table) {
    return std::data(table)[below(std::size(table))];
  }

 private:
  std::span<const std::uint8_t> bytes_;
  std::size_t next_ = 0;
};

}  // namespace ambrix_fuzz
