// Why files cannot be opened: the module does not say.
#pragma once

#include <filesystem>
#include <string>

#include "ambrix/module.h"

namespace ambrix::tool {

/// Throws `OpenError` for a path with which the library would wait for ever, or go on with another
/// file.
void requireOpenable(const std::string& path);

/// Why the library has refused the file, and what to do.
std::string explainRefusal(Module& module, const std::string& path);

/// Whether the module could not open a file.
bool isOpenFailure(const Error& error);

}  // namespace ambrix::tool
