// Work in a process of its own: a damaged file can make the CDF library crash or never return, and
// that must not be the end of the tool.
#pragma once

#include <cstddef>
#include <functional>
#include <string>

namespace ambrix::tool {

inline constexpr double kTimeLimit = 300;

/// Three quarters of the memory of this machine, in bytes.
std::size_t mostMemory() noexcept;

/// What a worker may take; 0 is no limit.
struct Limits {
  double seconds = kTimeLimit;        // without a new step, after which it is given up
  std::size_t memory = mostMemory();  // bytes of address space
};

/// How a worker has ended.
struct WorkerEnd {
  enum class Kind { kDone, kCrashed, kQuit, kKilled, kTooSlow, kInterrupted };
  Kind kind = Kind::kDone;
  int status = 0;              // what the work returned, if it is done
  int signal = 0;              // that ended it otherwise
  std::string step;            // the last that it began
  std::string reports;         // the lines that it left
  std::size_t unreported = 0;  // how many more there were
};

/// Runs the work, which throws nothing, in a child that is watched and may take what the limits
/// say. Its output goes where that of this process goes. A signal that ends this process ends the
/// child first; it takes effect when all `HeldSignals` of the caller are gone.
WorkerEnd supervise(const Limits& limits, const std::function<int()>& work);

/// What has happened to a worker that is not done, as "the CDF library crashed (...) while ...".
std::string describeEnd(const WorkerEnd& end, const Limits& limits);

/// The status of a worker that is done, or was interrupted. Throws `ToolError` for one that failed
/// on the file.
int statusOf(const WorkerEnd& end, const Limits& limits, const std::string& file);
/// The name in that error's identifier.
std::string identifierOf(const WorkerEnd& end);

}  // namespace ambrix::tool
