// Loads a plugin so that none of its symbols, nor of the libraries it brings, become global.
#include <dlfcn.h>

#include <cstdio>

int main(int argumentCount, char** arguments) {
  if (argumentCount != 3) return 64;
  void* const plugin = dlopen(arguments[1], RTLD_NOW | RTLD_LOCAL);
  if (plugin == nullptr) {
    std::fprintf(stderr, "%s\n", dlerror());
    return 65;
  }
  if (dlsym(RTLD_DEFAULT, "qvErrMsgId") != nullptr) return 66;  // then this would prove nothing
  auto* const run = reinterpret_cast<int (*)(const char*)>(dlsym(plugin, "runModule"));
  return run == nullptr ? 67 : run(arguments[2]);
}
