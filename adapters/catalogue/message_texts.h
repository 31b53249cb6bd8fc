// The texts of the messages, with {1} to {9} for their values.
#pragma once

#include <string_view>

namespace ambrix::catalogue {

/// The text for a message, or nothing when it has none.
std::string_view findText(std::string_view component, std::string_view identifier);

}  // namespace ambrix::catalogue
