// Where the CDF library may put what it needs for a while.
#pragma once

#include <filesystem>

namespace ambrix::tool {

/// A folder that goes with this object, and with it the files that the library forgets when it
/// fails. Without one it would leave them where the user is.
class ScratchFolder {
 public:
  /// In the folder for temporary files; if that cannot be written to, there is none.
  ScratchFolder();
  ScratchFolder(const ScratchFolder&) = delete;
  ScratchFolder& operator=(const ScratchFolder&) = delete;
  ~ScratchFolder();

  /// Tells the library of it, in this process.
  void use() const noexcept;

 private:
  std::filesystem::path path_;
};

/// The folder in use, or that for temporary files.
std::filesystem::path scratchFolder();

}  // namespace ambrix::tool
