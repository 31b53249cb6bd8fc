// `ambrix check`: whether files are sound.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include "ambrix/error.h"
#include "ambrix/file.h"
#include "tool/content/failure.h"
#include "tool/output/standard_output.h"
#include "tool/supervision/supervision.h"

namespace ambrix::tool {

struct CheckOptions {
  std::vector<std::string> files;
  bool json = false;
  bool quiet = false;
};

/// Something that is wrong with a file, or that kept a part of it from being read.
struct Problem {
  std::string place;  // `variable "B"`; empty for the file itself
  std::string identifier;
  std::string message;
};

enum class Soundness { kSound, kNotSound, kUndecided };

struct Verdict {
  std::string file;
  std::vector<Problem> problems;         // what is wrong
  std::vector<Problem> unread;           // what says nothing of the file, such as want of memory
  std::vector<std::string> unsupported;  // what could not be read for want of support
  std::size_t unlisted = 0;              // how many more of all these there are

  /// What is wrong decides; else nothing is known while something has not been read.
  [[nodiscard]] Soundness soundness() const;
};

/// Returns the exit status: of success only if all files are sound, and `kExitUndecided` if none
/// is known not to be. It does not depend on whether anybody reads the output.
int runCheck(const CheckOptions& options, const Limits& limits, StandardOutput& output);

/// Reads everything in a file and reports its findings to the watcher.
void examineFile(Module& module, const std::string& path);

/// Findings as the lines of a report, and back.
void reportProblem(const Problem& problem);
void reportUnread(const Problem& problem);
std::string unreadFinding(const Problem& problem);
/// Reports an error at a place, with its cause: the file, or a lack of memory or space.
void reportError(const std::string& place, const Error& error);
void reportRefusal(const OpenError& error);
void reportUnsupported(const std::string& what);
void takeFindings(std::string_view reports, Verdict& verdict);

std::string verdictAsText(const Verdict& verdict);
std::string verdictsAsJson(const std::vector<Verdict>& verdicts);

}  // namespace ambrix::tool
