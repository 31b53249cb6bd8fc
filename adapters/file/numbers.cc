#include "adapters/file/numbers.h"

#include <array>
#include <charconv>
#include <vector>

namespace ambrix {

Array rowOf(std::span<const std::size_t> sizes) {
  const std::vector<double> numbers(sizes.begin(), sizes.end());
  return Array::row(std::span<const double>(numbers));
}

std::string shortest(double number) {
  std::array<char, 32> digits{};
  const auto result = std::to_chars(digits.begin(), digits.end(), number);
  return {digits.begin(), result.ptr};
}

}  // namespace ambrix
