#include "tool/output_file.h"

#include <strings.h>
#include <unistd.h>

#include <cerrno>
#include <system_error>

#include "tool/failure.h"

namespace ambrix::tool {
namespace {

namespace fs = std::filesystem;

[[noreturn]] void failBecauseExists(const fs::path& path) {
  throw ToolError("outputExists", path.string() + " exists, and is not overwritten");
}

void enterFolder(const fs::path& folder) {
  std::error_code error;
  if (!folder.empty()) fs::current_path(folder, error);
  if (error) throw ToolError("noSuchFolder", folder.string() + ": " + error.message());
}

}  // namespace

OutputFile::OutputFile(const fs::path& path, const std::string& extension)
    : name_(path.filename()),
      temporaryName_(".ambrix-" + std::to_string(::getpid()) + "-unfinished" + extension) {
  std::error_code ignored;
  if (fs::exists(fs::symlink_status(path, ignored))) failBecauseExists(path);
  enterFolder(path.parent_path());
}

OutputFile::~OutputFile() {
  ::unlink(temporaryName_.c_str());
}

void OutputFile::publish() {
  if (::link(temporaryName_.c_str(), name_.c_str()) == 0) return;  // the destructor does the rest
  if (errno == EEXIST) failBecauseExists(name_);
  std::error_code error;  // a file system without links
  if (fs::exists(fs::symlink_status(name_, error))) failBecauseExists(name_);
  fs::rename(temporaryName_, name_, error);
  if (error) throw ToolError("cannotRename", name_.string() + ": " + error.message());
}

fs::path withCdfExtension(const fs::path& path) {
  if (::strcasecmp(path.extension().c_str(), ".cdf") == 0) return path;
  return fs::path(path) += ".cdf";
}

}  // namespace ambrix::tool
