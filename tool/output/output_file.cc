#include "tool/output/output_file.h"

#include <strings.h>
#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <system_error>
#include <utility>

#include "tool/content/failure.h"

namespace ambrix::tool {
namespace {

namespace fs = std::filesystem;

/// Throws unless nothing has the name yet.
void requireFree(const fs::path& path) {
  std::error_code error;
  const fs::file_status found = fs::symlink_status(path, error);
  if (fs::exists(found)) {
    throw ToolError("outputExists", path.string() + " exists, and is not overwritten");
  }
  if (found.type() == fs::file_type::none) {
    throw ToolError("cannotWrite", path.string() + ": " + error.message());
  }
}

fs::path makeFolder(const fs::path& parent) {
  std::string name = (parent / ".ambrix-XXXXXX").string();
  if (::mkdtemp(name.data()) != nullptr) return name;
  const int reason = errno;
  const bool missing = reason == ENOENT || reason == ENOTDIR;
  throw ToolError(
      missing ? "noSuchFolder" : "cannotWrite",
      (parent.empty() ? "." : parent.string()) + ": " + std::generic_category().message(reason));
}

}  // namespace

OutputFile::OutputFile(fs::path path, const std::string& extension)
    : path_(std::move(path)), unfinishedName_("unfinished" + extension) {
  requireFree(path_);
  folder_ = makeFolder(path_.parent_path());
}

OutputFile::~OutputFile() {
  std::error_code ignored;
  for (const fs::directory_entry& entry : fs::directory_iterator(folder_, ignored))
    fs::remove(entry, ignored);
  fs::remove(folder_, ignored);
}

void OutputFile::publish() {
  const fs::path unfinished = folder_ / unfinishedName_;
  if (::link(unfinished.c_str(), path_.c_str()) == 0) return;  // the destructor does the rest
  requireFree(path_);
  std::error_code error;  // a file system without links
  fs::rename(unfinished, path_, error);
  if (error) throw ToolError("cannotRename", path_.string() + ": " + error.message());
}

fs::path withCdfExtension(const fs::path& path) {
  if (::strcasecmp(path.extension().c_str(), ".cdf") == 0) return path;
  return fs::path(path) += ".cdf";
}

}  // namespace ambrix::tool
