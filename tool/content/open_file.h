// Files as the tool opens them: their steps are told to its watcher, their failures to people.
#pragma once

#include <string>

#include "ambrix/file.h"

namespace ambrix::tool {

/// Throws `OpenError` with the cause when the file cannot be opened.
File openFile(Module& module, const std::string& path, Access access = Access::kRead);

/// Tells errors of a file that was created by the name that people know, as `NamedError`.
class CreatedFileObserver : public FileObserver {
 public:
  explicit CreatedFileObserver(std::string shownName) : shownName_(std::move(shownName)) {}
  void failed(const Error& error) override;

 private:
  std::string shownName_;
};

}  // namespace ambrix::tool
