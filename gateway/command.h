// One command as the dispatcher sees it.
#pragma once

#include <cstdint>

#include "host/qv.h"

namespace TOLVEX::ambrix {

struct CommandEntry;

/// Carries a command out: reads its arguments by position (the command name is not among them),
/// fills its output slots from the first whatever number is wanted, and returns nothing.
using Handler = void (*)(int outputCount, qvArray* outputs[], std::int32_t argumentCount,
                         const qvArray* arguments[], const CommandEntry* entry);

struct CommandEntry {
  std::int32_t id;
  const char* name;  // as the user types it
  std::int32_t minimumArguments;
  std::int32_t maximumArguments;
  Handler handler;
};

}  // namespace TOLVEX::ambrix
