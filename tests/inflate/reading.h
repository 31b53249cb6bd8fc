// A stream read as the CDF library reads it, by its own zlib or by what stands before that.
#pragma once

#include <cstddef>
#include <string>
#include <vector>

#include "inflate/zlib_abi.h"

namespace ambrix_test {

/// What reading a stream comes to.
struct Outcome {
  int status = 0;  // of the last call
  std::string data;
  std::string message;
  unsigned long totalOut = 0;
  std::size_t pieces = 0;  // that were asked for
  unsigned long totalIn = 0;
  unsigned long checksum = 0;
};

/// The most that is given and taken in a call.
struct Pieces {
  std::size_t input = 65536;
  std::size_t output = 65536;
};

Outcome readByLibrary(const std::string& stream, const Pieces& pieces = {}, int flush = 0);
Outcome readByStream(const std::string& stream, const Pieces& pieces = {}, int flush = 0);

}  // namespace ambrix_test
