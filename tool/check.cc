#include "tool/check.h"

#include <unistd.h>

#include <cerrno>
#include <cstdlib>
#include <cstring>
#include <exception>
#include <filesystem>
#include <system_error>

#include "tool/call.h"
#include "tool/failure.h"
#include "tool/session.h"
#include "tool/supervision.h"

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
  Module module;
  module.setWarningHandler([](const MessageId&) {});
  setByteLimit(kSessionArrayBytes);
  examineFile(module, path);
  return EXIT_SUCCESS;
} catch (const Error& error) {
  tellProblem({"", error.identifier(), error.what()});
  return EXIT_SUCCESS;
} catch (const ToolError& error) {
  tellProblem({"", error.identifier(), error.what()});
  return EXIT_SUCCESS;
} catch (const std::exception& error) {
  tellProblem({"", "ambrix:failure", error.what()});
  return EXIT_SUCCESS;
}

Verdict check(const std::string& path, const Limits& limits) {
  Verdict verdict{path, {}, {}, 0};
  if (const int reason = unreadable(path); reason != 0) {
    verdict.problems.push_back({"", "ambrix:unreadable", std::strerror(reason)});
    return verdict;
  }
  const WorkerEnd end = supervise(limits, [&] { return examine(path); });
  takeFindings(end.told, verdict);
  verdict.unlisted = end.untold;
  if (end.kind != WorkerEnd::Kind::kDone) {
    verdict.problems.push_back({"", "ambrix:" + identifierOf(end), describeEnd(end, limits)});
  }
  return verdict;
}

}  // namespace

int runCheck(const CheckOptions& options, const Limits& limits, StandardOutput& output) {
  std::vector<Verdict> shown;
  bool allSound = true;
  for (const std::string& path : options.files) {
    Verdict verdict = check(path, limits);
    allSound = allSound && verdict.sound();
    if (options.quiet && verdict.sound()) continue;
    if (options.json) {
      shown.push_back(std::move(verdict));
      continue;
    }
    output.write(verdictAsText(verdict));
    output.flush();
  }
  if (options.json) output.write(verdictsAsJson(shown));
  return allSound ? EXIT_SUCCESS : kExitFailure;
}

}  // namespace ambrix::tool
