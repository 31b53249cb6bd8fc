// Arguments with which each command succeeds.
#pragma once

#include "tests/support/command_signatures.h"
#include "tests/support/given.h"

namespace ambrix_test {

/// An argument of a kind: of attribute 2 and its entry 5, and of variable 3, which is 2 by 3
/// doubles.
Given exampleOf(const Argument& argument);

/// All arguments of a command, those that can be left out too.
Arguments examplesOf(const Command& command);

}  // namespace ambrix_test
