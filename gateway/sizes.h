// Products of sizes that cannot wrap around.
#pragma once

#include <cstddef>
#include <initializer_list>
#include <limits>
#include <span>

namespace TOLVEX::ambrix {

inline constexpr long kLongMax = std::numeric_limits<long>::max();
inline constexpr long kLongMin = std::numeric_limits<long>::min();

/// The product, or the nearest value that a long can hold.
constexpr long multiplySaturated(long a, long b) {
  long product = 0;
  if (!__builtin_mul_overflow(a, b, &product)) return product;
  return (a < 0) == (b < 0) ? kLongMax : kLongMin;
}

/// The product of all factors: 1 for none, 0 as soon as one is 0 however large the others are.
constexpr long productOf(std::span<const long> factors) {
  long product = 1;
  for (const long factor : factors)
    product = multiplySaturated(product, factor);
  return product;
}

/// The product as a number of bytes or elements: none if it is negative, and the largest long if it
/// is too large to count.
constexpr std::size_t saturatedProduct(std::initializer_list<long> factors) {
  const long product = productOf({factors.begin(), factors.size()});
  return product < 0 ? 0 : static_cast<std::size_t>(product);
}

}  // namespace TOLVEX::ambrix
