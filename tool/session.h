// `ambrix session`: calls of the module through a pipe.
#pragma once

#include <cstddef>
#include <string>
#include <string_view>

#include "ambrix/module.h"
#include "tool/standard_output.h"

namespace ambrix::tool {

inline constexpr std::size_t kSessionArrayBytes = std::size_t{4} << 30;

/// Answers each line of standard input with a line, until the input ends; then unloads the module
/// and writes a last line.
void runSession(std::size_t maxArrayBytes, StandardOutput& output);

/// The answer to one request line.
std::string answerRequest(Module& module, std::string_view line);

}  // namespace ambrix::tool
