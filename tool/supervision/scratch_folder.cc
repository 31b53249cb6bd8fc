#include "tool/supervision/scratch_folder.h"

#include <cstdlib>
#include <string>
#include <system_error>

namespace ambrix::tool {
namespace {

namespace fs = std::filesystem;

constexpr const char* kVariable = "CDF_TMP";

std::string makeFolder() {
  const char* const wanted = std::getenv(kVariable);
  std::error_code error;
  const fs::path usual = fs::temp_directory_path(error);
  if (error && wanted == nullptr) return "";
  const fs::path parent = fs::absolute(wanted != nullptr ? fs::path(wanted) : usual);
  std::string name = (parent / "ambrix-XXXXXX").string();
  return ::mkdtemp(name.data()) != nullptr ? name : "";
}

}  // namespace

ScratchFolder::ScratchFolder() : path_(makeFolder()) {}

ScratchFolder::~ScratchFolder() {
  std::error_code ignored;
  if (!path_.empty()) fs::remove_all(path_, ignored);
}

fs::path scratchFolder() {
  const char* const used = std::getenv(kVariable);
  return used != nullptr ? fs::path(used) : fs::temp_directory_path();
}

void ScratchFolder::use() const noexcept {
  if (!path_.empty()) ::setenv(kVariable, path_.c_str(), 1);
}

}  // namespace ambrix::tool
