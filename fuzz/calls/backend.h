// What stands behind the module in a program: the CDF library with files in the current folder, or
// the scripted library. Each program links one implementation of these functions.
#pragma once

#include <ambrix/embedded.h>

#include <optional>

#include "fuzz/calls/choices.h"
#include "fuzz/calls/world.h"

namespace ambrix_fuzz {

/// A sequence of calls begins, or has ended with all files closed.
void beginSequence(Choices& choices);
void endSequence();

/// A call is about to be made: the last chance to decide what the library will answer.
void beforeCall(Choices& choices);

/// What the library will say of each variable, where that does not depend on the file.
std::optional<Variable> scriptedVariable();

/// Replaces arguments that are legal and would keep a sound library busy for hours.
void confine(const char* command, std::vector<ambrix::Array>& arguments);

}  // namespace ambrix_fuzz
