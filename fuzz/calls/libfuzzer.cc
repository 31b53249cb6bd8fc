// The same sequences, guided by libFuzzer.
#include <cstddef>
#include <cstdint>

#include "fuzz/calls/mode.h"
#include "fuzz/calls/sequence.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size);
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
  ambrix_fuzz::setExtended(size % 2 != 0);
  ambrix_fuzz::runSequence({data, size});
  return 0;
}
