// Reading a file in a process of its own, which it may bring down.
#pragma once

#include <filesystem>
#include <functional>
#include <string>

#include "fuzz/files/whole_read.h"

namespace ambrix::fuzz {

/// How the reading of a file has ended. The first three are orderly, the last is a fault of ours.
enum class Outcome { kWhole, kWithErrors, kRefused, kCrashed, kHung, kFault };

struct Result {
  Outcome outcome = Outcome::kWhole;
  std::string details;  // where it crashed, or what is at fault
};

/// Runs the reading in a child for at most so many seconds. What the child prints goes to `log`.
Result runInChild(const std::function<Reading()>& read, double seconds,
                  const std::filesystem::path& log);

}  // namespace ambrix::fuzz
