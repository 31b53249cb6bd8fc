#include "tool/check/check.h"

#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <exception>
#include <filesystem>
#include <set>
#include <system_error>

#include "tool/call/call.h"
#include "tool/content/failure.h"
#include "tool/session/session.h"
#include "tool/supervision/scarcity.h"
#include "tool/supervision/supervision.h"

namespace ambrix::tool {
namespace {

namespace fs = std::filesystem;

/// Why nobody could read a file of this name, or 0.
int unreadableAs(const std::string& path) {
  if (::access(path.c_str(), R_OK) != 0) return errno;
  std::error_code error;
  return fs::is_directory(path, error) ? EISDIR : 0;
}

/// The same of a file that the library looks for, with the extension, too.
int unreadable(const std::string& path) {
  const int reason = unreadableAs(path);
  return reason == 0 || unreadableAs(path + ".cdf") == 0 ? 0 : reason;
}

/// The work of a child. Only what it tells counts; what it cannot tell is a failure of its own.
int examine(const std::string& path) try {
  reportScarcityInCrashes();
  Module module;
  module.setWarningHandler([](const MessageId&) {});
  setByteLimit(kSessionArrayBytes);
  examineFile(module, path);
  return EXIT_SUCCESS;
} catch (const Error& error) {
  reportError("", error);
  return EXIT_SUCCESS;
} catch (const OpenError& error) {
  reportRefusal(error);
  return EXIT_SUCCESS;
} catch (const ToolError& error) {
  reportUnread({"", error.identifier(), error.what()});
  return EXIT_SUCCESS;
} catch (const FileError& error) {
  reportUnread({"", error.identifier(), error.reason()});
  return EXIT_SUCCESS;
} catch (const LoadError& error) {
  reportUnread({"", "ambrix:moduleNotLoaded", error.what()});
  return EXIT_SUCCESS;
} catch (const std::exception& error) {
  reportUnread({"", "ambrix:failure", error.what()});
  return EXIT_SUCCESS;
}

/// Whether a worker's end is a sign of damage. One that was killed, or that took too long, has
/// only not come to know.
bool tellsOfDamage(const WorkerEnd& end, const Verdict& verdict) {
  const bool crashed = end.kind == WorkerEnd::Kind::kCrashed || end.kind == WorkerEnd::Kind::kQuit;
  return crashed && verdict.unread.empty();
}

Verdict check(const std::string& path, const Limits& limits) try {
  Verdict verdict{path, {}, {}, {}, 0};
  if (const int reason = unreadable(path); reason != 0) {
    const bool missing = reason == ENOENT || reason == ENOTDIR || reason == EISDIR;
    auto& list = missing ? verdict.problems : verdict.unread;
    list.push_back({"", "ambrix:unreadable", std::strerror(reason)});
    return verdict;
  }
  const WorkerEnd end = supervise(limits, [&] { return examine(path); });
  takeFindings(end.reports, verdict);
  verdict.unlisted = end.unreported;
  if (end.kind != WorkerEnd::Kind::kDone) {
    auto& list = tellsOfDamage(end, verdict) ? verdict.problems : verdict.unread;
    list.push_back({"", "ambrix:" + identifierOf(end), describeEnd(end, limits)});
  }
  return verdict;
} catch (const std::system_error& error) {  // no process, no memory to share with it
  return {path, {}, {{"", "ambrix:failure", error.what()}}, {}, 0};
}

/// Writes for those who read; the verdicts count whether or not anybody does.
void show(StandardOutput& output, const std::string& text) try {
  output.write(text);
  output.flush();
} catch (const OutputClosed&) {
}

int exitStatus(const std::set<Soundness>& found) {
  if (found.contains(Soundness::kNotSound)) return kExitFailure;
  return found.contains(Soundness::kUndecided) ? kExitUndecided : EXIT_SUCCESS;
}

}  // namespace

int runCheck(const CheckOptions& options, const Limits& limits, StandardOutput& output) {
  std::vector<Verdict> shown;
  std::set<Soundness> found;
  for (const std::string& path : options.files) {
    Verdict verdict = check(path, limits);
    found.insert(verdict.soundness());
    if (options.quiet && verdict.soundness() == Soundness::kSound) continue;
    if (options.json) {
      shown.push_back(std::move(verdict));
      continue;
    }
    show(output, verdictAsText(verdict));
  }
  if (options.json) show(output, verdictsAsJson(shown));
  return exitStatus(found);
}

}  // namespace ambrix::tool
