#include "tool/program/versions.h"

#include <dlfcn.h>

#include <cmath>

#include "ambrix/embedded.h"
#include "ambrix_version.h"

namespace ambrix::tool {
namespace {

std::string libraryVersion(Module& module) {
  std::string version;
  for (const Array& part : module.call("getLibraryVersion"))
    version += (version.empty() ? "" : ".") + std::to_string(std::lround(part.data<double>()[0]));
  return version;
}

/// The module brings the library along that knows, unless it was built without.
std::string inflater() {
  const auto path = defaultModulePath().parent_path() / "libambrix_inflate.so";
  void* const library = ::dlopen(path.c_str(), RTLD_NOW | RTLD_NOLOAD);
  if (library == nullptr) return "CDF library";
  auto* const ask = reinterpret_cast<const char* (*)()>(::dlsym(library, "ambrixInflater"));
  std::string name = ask == nullptr ? "CDF library" : ask();
  ::dlclose(library);
  return name;
}

}  // namespace

std::string versions() {
  Module module;
  return "ambrix " + std::string(kAmbrixVersion) + "\nCDF library " + libraryVersion(module) +
         "\nInflater " + inflater() + "\n";
}

}  // namespace ambrix::tool
