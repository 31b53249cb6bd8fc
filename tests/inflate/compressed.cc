#include "tests/inflate/compressed.h"

#include <cstring>
#include <stdexcept>

#include "tests/inflate/zlib_of_cdf.h"

namespace ambrix_test {
namespace {

constexpr int kFinish = 4;

std::string noise(std::size_t size, Random& random) {
  std::string data(size, '\0');
  for (char& byte : data)
    byte = static_cast<char>(random());
  return data;
}

std::string words(std::size_t size, Random& random) {
  std::string data;
  while (data.size() < size)
    data += "value " + std::to_string(random() % 1000) + (random() % 2 == 0 ? " nT, " : " km/s\n");
  data.resize(size);
  return data;
}

std::string doubles(std::size_t size, Random& random) {
  std::string data(size, '\0');
  double value = 0;
  for (std::size_t at = 0; at + sizeof value <= size; at += sizeof value) {
    value += static_cast<double>(random() % 8);
    std::memcpy(data.data() + at, &value, sizeof value);
  }
  return data;
}

std::string mixture(std::size_t size, Random& random) {
  std::string data;
  while (data.size() < size)
    data += dataOf(static_cast<int>(random() % 4), upTo(40'000, random), random);
  data.resize(size);
  return data;
}

}  // namespace

std::size_t upTo(std::size_t most, Random& random) {
  return random() % (most + 1);
}

std::string dataOf(int kind, std::size_t size, Random& random) {
  switch (kind) {
    case 0:
      return noise(size, random);
    case 1:
      return std::string(size, 'a');
    case 2:
      return words(size, random);
    case 3:
      return doubles(size, random);
    default:
      return mixture(size, random);
  }
}

std::string compressed(const std::string& data, const Compression& how) {
  ambrix::inflate::ZStream stream{};
  if (z_deflateInit2_(&stream, how.level, 8, how.windowBits, 8, how.strategy, "1", sizeof stream) !=
      ambrix::inflate::kOk) {
    throw std::invalid_argument("zlib refuses these parameters");
  }
  std::string result(data.size() + data.size() / 8 + 1000, '\0');
  stream.next_in = reinterpret_cast<const unsigned char*>(data.data());
  stream.avail_in = static_cast<unsigned int>(data.size());
  stream.next_out = reinterpret_cast<unsigned char*>(result.data());
  stream.avail_out = static_cast<unsigned int>(result.size());
  const int status = z_deflate(&stream, kFinish);
  result.resize(stream.total_out);
  z_deflateEnd(&stream);
  if (status != ambrix::inflate::kStreamEnd) throw std::logic_error("there was not enough room");
  return result;
}

}  // namespace ambrix_test
