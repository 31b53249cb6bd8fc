// The commands of the tool that read files: each reads in a process of its own.
#pragma once

#include "tool/output/standard_output.h"
#include "tool/program/command_line.h"

namespace ambrix::tool {

/// Runs the command that was asked for. Returns the exit status, or throws what went wrong.
int runCommand(const CLI::App& parser, const Arguments& arguments, StandardOutput& output);

}  // namespace ambrix::tool
