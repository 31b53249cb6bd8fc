// The manual page, made of what --help says.
#pragma once

#include <CLI/CLI.hpp>
#include <string>

namespace ambrix::tool {

/// The page ambrix(1) in the man macros.
std::string manualPage(const CLI::App& parser);

}  // namespace ambrix::tool
