// One call as it will be made, and what may be wrong with it.
#pragma once

#include <ambrix/embedded.h>

#include <cstddef>
#include <cstdint>
#include <limits>
#include <string>
#include <string_view>
#include <vector>

#include "fuzz/calls/choices.h"
#include "fuzz/calls/values.h"
#include "fuzz/calls/world.h"

namespace ambrix_fuzz {

struct CallInput {
  Array name;
  std::vector<Array> arguments;
  std::size_t outputs = ambrix::kAllOutputs;
  /// The argument that is shown to the module as an array of a class it has never heard of.
  std::size_t disguised = std::numeric_limits<std::size_t>::max();
  std::uint64_t failingAllocation = 0;

  /// What the world is after the call has succeeded.
  void apply(std::string_view command, const std::vector<Array>& results, World& world) const;
};

/// Leaves most calls as they are, and makes one thing wrong with the others.
void spoil(Choices& choices, const World& world, CallInput& input);

std::string shown(const CallInput& input);

}  // namespace ambrix_fuzz
