// A plugin that embeds the host: it calls the module at the given path and unloads it.
#include <ambrix/embedded.h>

#include <cstdio>
#include <exception>

extern "C" [[gnu::visibility("default")]] int runModule(const char* path);

extern "C" int runModule(const char* path) {
  try {
    ambrix::Module module{std::filesystem::path(path)};
    const std::vector<ambrix::Array> results = module.call("calls");
    return results.at(0).data<double>()[0] == 1.0 ? 0 : 1;
  } catch (const std::exception& error) {
    std::fprintf(stderr, "%s\n", error.what());
    return 2;
  }
}
