// What becomes of the failures of a command.
#pragma once

#include <CLI/CLI.hpp>
#include <functional>

namespace ambrix::tool {

/// Runs the work and returns its exit status. What it throws is told on standard error and becomes
/// the exit status that stands for it.
int exitStatusOf(const CLI::App& parser, const std::function<int()>& work);

}  // namespace ambrix::tool
