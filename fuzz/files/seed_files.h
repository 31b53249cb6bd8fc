// Valid files, one of each make, to be damaged.
#pragma once

#include <filesystem>
#include <string>
#include <vector>

#include "ambrix/module.h"

namespace ambrix::fuzz {

/// A file in memory: what is damaged, and the files that go with it.
struct SeedFile {
  struct Part {
    std::string extension;  // ".cdf", or ".v0" and the like beside it
    std::string bytes;
  };
  std::string make;
  std::vector<Part> parts;
};

/// Makes them in a folder, and takes them from there.
std::vector<SeedFile> makeSeedFiles(Module& module, const std::filesystem::path& folder);

}  // namespace ambrix::fuzz
