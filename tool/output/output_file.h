// A file that appears under its name only when it is complete.
#pragma once

#include <filesystem>
#include <string>

#include "tool/supervision/held_signals.h"

namespace ambrix::tool {

/// A file on its way. It is written in a new folder beside the place where it will stand, which
/// nobody else can enter. Unless `publish` is called, nothing stays when this object goes. Until
/// then it holds back the signals that end the process.
class OutputFile {
 public:
  /// The unfinished file gets the extension. Throws `ToolError` when there is something of that
  /// name or nothing can be written beside it.
  explicit OutputFile(std::filesystem::path path, const std::string& extension = "");
  OutputFile(const OutputFile&) = delete;
  OutputFile& operator=(const OutputFile&) = delete;
  ~OutputFile();

  /// The new folder, and the name of the file to write there.
  [[nodiscard]] const std::filesystem::path& folder() const noexcept { return folder_; }
  [[nodiscard]] const std::string& unfinishedName() const noexcept { return unfinishedName_; }
  /// Gives the file its name. Throws `ToolError` when another has come to bear it.
  void publish();

 private:
  HeldSignals held_;
  std::filesystem::path path_;
  std::filesystem::path folder_;
  std::string unfinishedName_;
};

/// The path with the extension ".cdf", which is added when there is none, in whatever case.
std::filesystem::path withCdfExtension(const std::filesystem::path& path);

}  // namespace ambrix::tool
