#include "tests/support/host_texts.h"

#include <dlfcn.h>

#include <utility>

#include "host/qv.h"

namespace {

std::size_t copies = 0;

}  // namespace

// Stands before the embedded host's in the order in which symbols are looked up.
extern "C" [[gnu::visibility("default")]] char* qvArrayToString(const qvArray* array) {
  using Copy = char* (*)(const qvArray*);
  static const auto original = reinterpret_cast<Copy>(dlsym(RTLD_NEXT, "qvArrayToString"));
  ++copies;
  return original(array);
}

namespace ambrix_test {

std::size_t narrowCopiesMade() {
  return std::exchange(copies, 0);
}

}  // namespace ambrix_test
