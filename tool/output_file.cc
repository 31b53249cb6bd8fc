#include "tool/output_file.h"

#include <strings.h>
#include <unistd.h>

#include <array>
#include <cerrno>
#include <csignal>
#include <cstring>
#include <system_error>

#include "tool/failure.h"

namespace ambrix::tool {
namespace {

namespace fs = std::filesystem;

constexpr std::array kEndingSignals = {SIGINT, SIGTERM, SIGHUP};

/// What the signal handler removes: it may not touch more than plain memory.
std::array<char, 64> unfinished{};

void removeUnfinished(int signal) {
  ::unlink(unfinished.data());
  std::signal(signal, SIG_DFL);
  std::raise(signal);
}

[[noreturn]] void failBecauseExists(const fs::path& path) {
  throw ToolError("outputExists", path.string() + " exists, and is not overwritten");
}

void enterFolder(const fs::path& folder) {
  std::error_code error;
  if (!folder.empty()) fs::current_path(folder, error);
  if (error) throw ToolError("noSuchFolder", folder.string() + ": " + error.message());
}

}  // namespace

OutputFile::OutputFile(const fs::path& path)
    : name_(path.filename()),
      temporaryName_(".ambrix-" + std::to_string(::getpid()) + "-unfinished.cdf") {
  std::error_code ignored;
  if (fs::exists(fs::symlink_status(path, ignored))) failBecauseExists(path);
  enterFolder(path.parent_path());
  std::memcpy(unfinished.data(), temporaryName_.c_str(), temporaryName_.size() + 1);
  for (const int signal : kEndingSignals)
    std::signal(signal, removeUnfinished);
}

OutputFile::~OutputFile() {
  ::unlink(temporaryName_.c_str());
  for (const int signal : kEndingSignals)
    std::signal(signal, SIG_DFL);
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
