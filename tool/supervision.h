// Work in a process of its own: a damaged file can make the CDF library crash or never return, and
// that must not be the end of the tool.
#pragma once

#include <cstddef>
#include <functional>
#include <string>

namespace ambrix::tool {

/// Seconds without a new step after which a worker is given up; 0 is never.
inline constexpr double kTimeLimit = 300;

/// How a worker has ended.
struct WorkerEnd {
  enum class Kind { kDone, kCrashed, kQuit, kKilled, kTooSlow, kInterrupted };
  Kind kind = Kind::kDone;
  int status = 0;          // what the work returned, if it is done
  int signal = 0;          // that ended it otherwise
  std::string step;        // the last that it began
  std::string told;        // the lines that it left
  std::size_t untold = 0;  // how many more there were
};

/// Runs the work, which throws nothing, in a child that is watched: what a step of it may take is
/// `timeLimit` seconds. Its output goes where that of this process goes. A signal that ends this
/// process ends the child first; it takes effect when all `HeldSignals` of the caller are gone.
WorkerEnd supervise(double timeLimit, const std::function<int()>& work);

/// What has happened to a worker that is not done, as "the CDF library crashed (...) while ...".
std::string describeEnd(const WorkerEnd& end, double timeLimit);

/// The status of a worker that is done, or was interrupted. Throws `ToolError` for one that failed
/// on the file.
int statusOf(const WorkerEnd& end, double timeLimit, const std::string& file);
/// The name in that error's identifier.
std::string identifierOf(const WorkerEnd& end);

}  // namespace ambrix::tool
