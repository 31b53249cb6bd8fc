// Data of several kinds, and gzip streams of them as the CDF library makes them.
#pragma once

#include <array>
#include <cstddef>
#include <random>
#include <string>

namespace ambrix_test {

using Random = std::mt19937;

/// How data are compressed: the parameters of zlib's deflateInit2.
struct Compression {
  int level = 6;
  int windowBits = 15 + 16;
  int strategy = 0;  // 2: no matches, 3: runs only, 4: codes that are not sent along
};

std::string compressed(const std::string& data, const Compression& how = {});

inline constexpr int kKinds = 5;

/// Bytes of one kind: noise, all the same, words, slowly rising doubles, or a mixture.
std::string dataOf(int kind, std::size_t size, Random& random);

std::size_t upTo(std::size_t most, Random& random);

}  // namespace ambrix_test
