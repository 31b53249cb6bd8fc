// `ambrix call`: one command.
#pragma once

#include <string>
#include <vector>

#include "ambrix/module.h"
#include "tool/output/standard_output.h"

namespace ambrix::tool {

struct CallOptions {
  std::string file;
  bool extended = false;
  std::vector<std::string> words;  // the command and its arguments
};

/// Calls a command and prints its results. Throws `UsageError` for arguments that stand for no
/// array, and what the command raises.
void runCall(Module& module, const CallOptions& options, StandardOutput& output);

}  // namespace ambrix::tool
