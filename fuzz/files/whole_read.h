// Reading all of a file that may be damaged, as a user of the module would.
#pragma once

#include <string>

#include "ambrix/module.h"

namespace ambrix::fuzz {

enum class Reading { kWhole, kWithErrors, kRefused };

/// Calls every command that reads. Throws whatever is no error that the module may raise.
Reading readWhole(Module& module, const std::string& path, bool validated);

}  // namespace ambrix::fuzz
