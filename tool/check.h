// `ambrix check`: whether files are sound.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>
#include <vector>

#include "tool/cdf_file.h"
#include "tool/standard_output.h"
#include "tool/supervision.h"

namespace ambrix::tool {

struct CheckOptions {
  std::vector<std::string> files;
  bool json = false;
  bool quiet = false;
};

/// Something that is wrong with a file.
struct Problem {
  std::string place;  // `variable "B"`; empty for the file itself
  std::string identifier;
  std::string message;
};

struct Verdict {
  std::string file;
  std::vector<Problem> problems;
  std::vector<std::string> unsupported;  // what could not be read for want of support
  std::size_t unlisted = 0;              // how many more of both there are

  [[nodiscard]] bool sound() const { return problems.empty(); }
};

/// Returns the exit status: of success only if all files are sound.
int runCheck(const CheckOptions& options, const Limits& limits, StandardOutput& output);

/// Reads all that is in a file and tells its watcher what it finds.
void examineFile(Module& module, const std::string& path);

/// Findings as the lines that a worker leaves, and back.
void tellProblem(const Problem& problem);
void tellUnsupported(const std::string& what);
void takeFindings(std::string_view told, Verdict& verdict);

std::string verdictAsText(const Verdict& verdict);
std::string verdictsAsJson(const std::vector<Verdict>& verdicts);

}  // namespace ambrix::tool
