// The fixed table of commands and the look-up in it.
#pragma once

#include <cstdint>
#include <span>
#include <string_view>

#include "gateway/command.h"

namespace TOLVEX::ambrix {

/// All 91 rows, in table order.
std::span<const CommandEntry> commandTable();

/// The row of exactly this name, also one of the host's extension, if the number of arguments after
/// the name suits it; else raises `invalidOperation` or `wrongNumberOfInputs`.
const CommandEntry& lookupCommand(std::string_view name, std::int32_t argumentCount);

}  // namespace TOLVEX::ambrix
