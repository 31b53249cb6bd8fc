// Warnings of the module, as people see them.
#pragma once

#include "ambrix/error.h"

namespace ambrix::tool {

/// Prints a warning to standard error.
void printWarning(const MessageId& id);

}  // namespace ambrix::tool
