#include "tool/supervision/held_signals.h"

#include <algorithm>
#include <array>

namespace ambrix::tool {
namespace {

/// Those that stop and continue a program or that it does not notice; the rest end it.
constexpr std::array kHarmlessSignals = {SIGCHLD, SIGCONT, SIGSTOP, SIGTSTP,
                                         SIGTTIN, SIGTTOU, SIGURG,  SIGWINCH};
/// Those by which a program ends on account of a fault of its own.
constexpr std::array kCrashes = {SIGABRT, SIGBUS, SIGFPE, SIGILL, SIGSEGV, SIGSYS, SIGTRAP};

bool isAmong(const auto& signals, int signal) noexcept {
  return std::ranges::find(signals, signal) != signals.end();
}

/// Whether the signal would end this process now: nobody ignores or handles it.
bool wouldEnd(int signal) noexcept {
  struct sigaction action = {};
  return !isAmong(kHarmlessSignals, signal) && signal != SIGKILL &&
         ::sigaction(signal, nullptr, &action) == 0 && action.sa_handler == SIG_DFL;
}

}  // namespace

bool isCrash(int signal) noexcept {
  return isAmong(kCrashes, signal);
}

HeldSignals::HeldSignals() noexcept : held_{}, before_{} {
  std::signal(SIGCHLD, SIG_DFL);  // if ignored, nobody could wait for children
  ::sigemptyset(&held_);
  ::sigaddset(&held_, SIGCHLD);
  for (int signal = 1; signal < NSIG; ++signal)
    if (wouldEnd(signal)) ::sigaddset(&held_, signal);
  ::sigprocmask(SIG_BLOCK, &held_, &before_);
}

HeldSignals::~HeldSignals() {
  ::sigprocmask(SIG_SETMASK, &before_, nullptr);
}

void HeldSignals::release() const noexcept {
  ::sigprocmask(SIG_UNBLOCK, &held_, nullptr);
}

}  // namespace ambrix::tool
