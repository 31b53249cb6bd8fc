// The commands as their users know them, restated by hand: what they take and what they return.
#pragma once

#include <cstddef>
#include <span>
#include <string_view>

namespace ambrix_fuzz {

struct Command {
  const char* name;
  /// One letter for each argument, as `makeArgument` understands them; those behind a '?' can be
  /// left out.
  const char* arguments;
  /// One letter for each result, as `isSane` understands them.
  const char* results;
};

std::span<const Command> commands();

/// The place of a command in the table; their number for a name that is none.
std::size_t placeOf(std::string_view name);

}  // namespace ambrix_fuzz
