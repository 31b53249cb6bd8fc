// What is added to the module's tables for hosts that offer extended datatypes (docs/extended.md).
// The tables are asked for it only when they have no row of their own.
#pragma once

#include <span>

#include "gateway/command.h"
#include "host/qv.h"

namespace TOLVEX::ambrix {

struct Datatype;

struct NamedConstant {
  const char* name;  // in upper case
  double value;
};

struct Extension {
  std::span<const Datatype> datatypes;
  std::span<const NamedConstant> constants;
  std::span<const CommandEntry> commands;
};

/// What the host of the call under way offers: nothing, unless it says so. A module can be built
/// without extended/ and with an empty extension in its place.
const Extension& extension();

}  // namespace TOLVEX::ambrix
