#include "adapters/embedded/loaded_module.h"

#include <dlfcn.h>

#include <array>
#include <cstddef>
#include <cstdio>
#include <mutex>
#include <new>
#include <set>
#include <string>

#include "ambrix/module.h"

namespace ambrix {
namespace {

/// The modules in use. One that were loaded twice would have its files closed by the first to go.
struct LoadedModules {
  std::mutex mutex;
  std::set<void*> handles;
};

/// Never destroyed: a program's static modules may go after the static objects of this library.
LoadedModules& loadedModules() {
  alignas(LoadedModules) static std::byte place[sizeof(LoadedModules)];
  static auto& modules = *new (place) LoadedModules;
  return modules;
}

std::filesystem::path pathOfThisLibrary() {
  Dl_info info{};
  const auto* const address = reinterpret_cast<const void*>(&pathOfThisLibrary);
  if (dladdr(address, &info) == 0 || info.dli_fname == nullptr) return {};
  return info.dli_fname;
}

/// The module finds the functions it calls among the global symbols. They are not there when a
/// program's plugin has brought this library in, until it is opened again as global.
void exportInterface() {
  void* const self = dlopen(pathOfThisLibrary().c_str(), RTLD_NOW | RTLD_NOLOAD | RTLD_GLOBAL);
  if (self != nullptr) dlclose(self);
}

std::string versionText(std::uint32_t release, std::uint32_t api) {
  std::array<char, 64> text{};
  std::snprintf(text.data(), text.size(), "release %08x with array interface %08x", release, api);
  return text.data();
}

[[noreturn]] void fail(const std::filesystem::path& path, const std::string& reason) {
  throw LoadError("The module " + path.string() + " can't be loaded: " + reason);
}

void* open(const std::filesystem::path& path) {
  exportInterface();
  // Without a folder in its name, a file would be looked for in the loader's folders.
  void* const handle = dlopen(std::filesystem::absolute(path).c_str(), RTLD_NOW | RTLD_LOCAL);
  if (handle == nullptr) fail(path, dlerror());
  const std::scoped_lock lock(loadedModules().mutex);
  if (loadedModules().handles.insert(handle).second) return handle;
  dlclose(handle);
  fail(path, "it is loaded already.");
}

/// An exported function of the module, with the type that the interface gives it.
template <typename Function>
Function* find(void* handle, const char* name, const std::filesystem::path& path) {
  void* const symbol = dlsym(handle, name);
  if (symbol == nullptr) fail(path, std::string("it is no module, for it lacks ") + name + '.');
  return reinterpret_cast<Function*>(symbol);
}

}  // namespace

LoadedModule::LoadedModule(const std::filesystem::path& path) : handle_(open(path)) {
  entryPoint_ = find<decltype(qvhFunction)>(handle_.get(), "qvhFunction", path);
  auto* const askVersion =
      find<decltype(qvhfilerequiredapiversion)>(handle_.get(), "qvhfilerequiredapiversion", path);
  std::uint32_t release = 0;
  std::uint32_t api = 0;
  askVersion(&release, &api);
  if (release == qvhReleaseCode && api == qvhApiVersion) return;
  fail(path, "it was built for " + versionText(release, api) + ", and this host is " +
                 versionText(qvhReleaseCode, qvhApiVersion) + '.');
}

void LoadedModule::Close::operator()(void* handle) const noexcept {
  {
    const std::scoped_lock lock(loadedModules().mutex);
    loadedModules().handles.erase(handle);
  }
  dlclose(handle);
}

std::filesystem::path defaultModulePath() {
  return pathOfThisLibrary().parent_path() / "ambrix_module.so";
}

}  // namespace ambrix
