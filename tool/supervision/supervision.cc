#include "tool/supervision/supervision.h"

#include <fmt/format.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>
#ifdef __linux__
#include <sys/prctl.h>
#endif

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <system_error>

#include "tool/content/failure.h"
#include "tool/output/standard_output.h"
#include "tool/output/text.h"
#include "tool/supervision/held_signals.h"
#include "tool/supervision/scratch_folder.h"
#include "tool/supervision/steps.h"

namespace ambrix::tool {
namespace {

using Kind = WorkerEnd::Kind;

constexpr std::chrono::milliseconds kTick(100);

/// A size in a damaged file can make the library fill all memory there is.
void limitMemory(std::size_t bytes) {
#ifdef __SANITIZE_ADDRESS__
  bytes = 0;  // most of the address space is the sanitizer's
#endif
  rlimit space = {};
  if (bytes == 0 || ::getrlimit(RLIMIT_AS, &space) != 0) return;
  space.rlim_cur = std::min<rlim_t>(space.rlim_cur, bytes);
  ::setrlimit(RLIMIT_AS, &space);
}

/// Dies with its watcher, leaves no core file, and takes a file that has become too large for an
/// error of writing.
void prepareWorker(pid_t watcher, const Limits& limits) {
#ifdef __linux__
  ::prctl(PR_SET_PDEATHSIG, SIGKILL);
#endif
  if (::getppid() != watcher) ::_exit(EXIT_FAILURE);
  const rlimit none = {0, 0};
  ::setrlimit(RLIMIT_CORE, &none);
  std::signal(SIGXFSZ, SIG_IGN);
  limitMemory(limits.memory);
}

/// Counts the time in which a worker gets nowhere. It counts ticks, so that the time in which this
/// process was stopped is left out.
class Patience {
 public:
  Patience(double seconds, const Steps& steps) : left_(seconds), limit_(seconds), steps_(steps) {}

  /// Returns whether it is over.
  bool tick() {
    if (steps_.paused() || steps_.count() != step_) left_ = limit_;
    step_ = steps_.count();
    left_ -= std::chrono::duration<double>(kTick).count();
    return limit_ > 0 && left_ <= 0;
  }

 private:
  double left_;
  double limit_;
  const Steps& steps_;
  std::uint32_t step_ = 0;
};

int waitFor(pid_t worker, int options, bool& gone) {
  int status = 0;
  pid_t answer = 0;
  do {
    answer = ::waitpid(worker, &status, options);
  } while (answer < 0 && errno == EINTR);
  gone = answer == worker;
  return status;
}

WorkerEnd giveUp(pid_t worker, Kind kind, int signal) {
  bool gone = false;
  ::kill(worker, SIGKILL);
  waitFor(worker, 0, gone);
  WorkerEnd end;
  end.kind = kind;
  end.signal = signal;
  return end;
}

WorkerEnd endOf(int status, const Steps& steps) {
  WorkerEnd end;
  if (WIFEXITED(status)) {
    end.kind = steps.finished() ? Kind::kDone : Kind::kQuit;
    end.status = WEXITSTATUS(status);
  } else {
    end.signal = WTERMSIG(status);
    const bool killed = end.signal == SIGKILL || end.signal == SIGXCPU;
    end.kind = isCrash(end.signal) ? Kind::kCrashed : killed ? Kind::kKilled : Kind::kInterrupted;
  }
  return end;
}

WorkerEnd watch(pid_t worker, const HeldSignals& held, const Steps& steps, double timeLimit) {
  const timespec tick = {0, std::chrono::nanoseconds(kTick).count()};
  Patience patience(timeLimit, steps);
  for (;;) {
    const int signal = ::sigtimedwait(&held.all(), nullptr, &tick);
    if (signal > 0 && signal != SIGCHLD) return giveUp(worker, Kind::kInterrupted, signal);
    bool gone = false;
    const int status = waitFor(worker, WNOHANG, gone);
    if (gone) return endOf(status, steps);
    if (signal < 0 && patience.tick()) return giveUp(worker, Kind::kTooSlow, SIGKILL);
  }
}

}  // namespace

std::size_t mostMemory() noexcept {
  const long pages = ::sysconf(_SC_PHYS_PAGES);
  const long bytes = ::sysconf(_SC_PAGESIZE);
  if (pages <= 0 || bytes <= 0) return 0;
  return static_cast<std::size_t>(pages) / 4 * 3 * static_cast<std::size_t>(bytes);
}

WorkerEnd supervise(const Limits& limits, const std::function<int()>& work) {
  const HeldSignals held;
  const Steps steps;
  const ScratchFolder scratch;
  const pid_t watcher = ::getpid();
  const pid_t worker = ::fork();
  if (worker < 0) throw std::system_error(errno, std::generic_category(), "fork");
  if (worker == 0) {
    prepareWorker(watcher, limits);
    scratch.use();
    held.release();
    steps.adopt();
    const int status = work();
    steps.finish();
    std::exit(status);
  }
  WorkerEnd end = watch(worker, held, steps, limits.seconds);
  end.step = steps.last();
  end.reports = steps.reports();
  end.unreported = steps.unreported();
  if (end.kind == Kind::kInterrupted) std::raise(end.signal);
  return end;
}

std::string describeEnd(const WorkerEnd& end, const Limits& limits) {
  const std::string during = end.step.empty() ? "" : " while " + end.step;
  switch (end.kind) {
    case Kind::kCrashed:
      return fmt::format("the CDF library crashed ({}){}", ::strsignal(end.signal), during);
    case Kind::kQuit:
      return "the CDF library ended the process" + during;
    case Kind::kKilled:
      return "the process was killed" + during + ", perhaps for lack of " +
             (end.signal == SIGXCPU ? "processor time" : "memory");
    case Kind::kTooSlow:
      return fmt::format("nothing was read for {} seconds{}", limits.seconds, during);
    case Kind::kInterrupted:
      return "it was interrupted" + during;
    case Kind::kDone:
      break;
  }
  return "the work is complete";
}

std::string identifierOf(const WorkerEnd& end) {
  if (end.kind == Kind::kTooSlow) return "timeLimitReached";
  if (end.kind == Kind::kKilled) return "killed";
  return "libraryCrashed";
}

int statusOf(const WorkerEnd& end, const Limits& limits, const std::string& file) {
  if (end.kind == Kind::kDone) return end.status;
  if (end.kind == Kind::kInterrupted) return kExitFailure;
  if (errorIsTerminal()) std::fputs("\r\033[K", stderr);  // where a progress bar was
  const char* const advice =
      end.kind == Kind::kTooSlow  ? "the file may be damaged, see 'ambrix check'; --time-limit "
                                    "allows more time"
      : end.kind == Kind::kKilled ? "there is no complete output"
                                  : "the file is probably damaged, see 'ambrix check'";
  throw ToolError(identifierOf(end),
                  printable(file) + ": " + describeEnd(end, limits) + "; " + advice);
}

}  // namespace ambrix::tool
