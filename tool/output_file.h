// A file that appears under its name only when it is complete.
#pragma once

#include <filesystem>
#include <string>

#include "tool/held_signals.h"

namespace ambrix::tool {

/// A file on its way. It is written under a temporary name in the folder where it will stand,
/// which becomes the current folder, because the CDF library creates no file whose path has
/// characters outside ASCII. Unless `publish` is called, nothing stays when this object goes.
/// Until then it holds back the signals that end the process.
class OutputFile {
 public:
  /// The temporary name gets the extension. Throws `ToolError` when a file of that name exists or
  /// its folder cannot be entered.
  explicit OutputFile(const std::filesystem::path& path, const std::string& extension = "");
  OutputFile(const OutputFile&) = delete;
  OutputFile& operator=(const OutputFile&) = delete;
  ~OutputFile();

  /// Where to write.
  [[nodiscard]] const std::string& temporaryName() const noexcept { return temporaryName_; }
  /// Gives the file its name. Throws `ToolError` when another has come to bear it.
  void publish();

 private:
  HeldSignals held_;
  std::filesystem::path name_;
  std::string temporaryName_;
};

/// The path with the extension ".cdf", which is added when there is none, in whatever case.
std::filesystem::path withCdfExtension(const std::filesystem::path& path);

}  // namespace ambrix::tool
