// A module's shared library.
#pragma once

#include <filesystem>
#include <memory>

#include "adapters/common/exported_interface.h"

namespace ambrix {

/// A module that is loaded as long as this lives, built for this release of the host.
class LoadedModule {
 public:
  /// Throws `LoadError`.
  explicit LoadedModule(const std::filesystem::path& path);

  [[nodiscard]] decltype(&qvhFunction) entryPoint() const noexcept { return entryPoint_; }

 private:
  struct Close {
    void operator()(void* handle) const noexcept;
  };

  std::unique_ptr<void, Close> handle_;
  decltype(&qvhFunction) entryPoint_ = nullptr;
};

}  // namespace ambrix
