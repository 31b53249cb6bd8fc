// What --version tells.
#pragma once

#include <string>

namespace ambrix::tool {

/// Of ambrix and of the CDF library, and what inflates for the latter: a line each.
std::string versions();

}  // namespace ambrix::tool
