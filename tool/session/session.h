// `ambrix session`: calls of the module through a pipe.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

#include "ambrix/module.h"
#include "tool/output/standard_output.h"

namespace ambrix::tool {

inline constexpr std::size_t kSessionArrayBytes = std::size_t{4} << 30;

struct SessionOptions {
  bool extended = false;
  std::size_t arrayBytes = kSessionArrayBytes;     // of one array or scratch buffer
  std::size_t lineBytes = std::size_t{256} << 20;  // of a request
};

/// Answers each line of standard input with a line, until the input ends; then unloads the module
/// and writes a last line.
void runSession(const SessionOptions& options, StandardOutput& output);

/// The answer to one request line.
std::string answerRequest(Module& module, std::string_view line);

}  // namespace ambrix::tool
