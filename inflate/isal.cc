#include "inflate/isal.h"

#include <dlfcn.h>

#include <cstdlib>
#include <string_view>

namespace ambrix::inflate {
namespace {

/// The interface that isa-l/igzip_lib.h declares.
constexpr char kLibrary[] = "libisal.so.2";

bool isWanted() {
  const char* const wanted = std::getenv("AMBRIX_INFLATER");
  return wanted == nullptr || std::string_view(wanted) != "cdf";
}

Isal open() {
  Isal found;
  void* const library = isWanted() ? dlopen(kLibrary, RTLD_NOW | RTLD_LOCAL) : nullptr;
  if (library == nullptr) return found;
  found.init = reinterpret_cast<decltype(found.init)>(dlsym(library, "isal_inflate_init"));
  found.inflate = reinterpret_cast<decltype(found.inflate)>(dlsym(library, "isal_inflate"));
  return found;  // it stays, as a library that is linked would
}

}  // namespace

const Isal& isal() {
  static const Isal library = open();
  return library;
}

}  // namespace ambrix::inflate
