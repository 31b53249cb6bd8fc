#include "tool/held_signals.h"

#include <algorithm>
#include <array>

namespace ambrix::tool {
namespace {

constexpr std::array kEndingSignals = {SIGHUP, SIGINT, SIGQUIT, SIGTERM};

bool isIgnored(int signal) noexcept {
  struct sigaction action = {};
  return ::sigaction(signal, nullptr, &action) == 0 && action.sa_handler == SIG_IGN;
}

}  // namespace

bool isEndingSignal(int signal) noexcept {
  return std::ranges::find(kEndingSignals, signal) != kEndingSignals.end();
}

HeldSignals::HeldSignals() noexcept : held_{}, before_{} {
  std::signal(SIGCHLD, SIG_DFL);  // if ignored, nobody could wait for children
  ::sigemptyset(&held_);
  ::sigaddset(&held_, SIGCHLD);
  for (const int signal : kEndingSignals)
    if (!isIgnored(signal)) ::sigaddset(&held_, signal);
  ::sigprocmask(SIG_BLOCK, &held_, &before_);
}

HeldSignals::~HeldSignals() {
  ::sigprocmask(SIG_SETMASK, &before_, nullptr);
}

void HeldSignals::release() const noexcept {
  ::sigprocmask(SIG_UNBLOCK, &held_, nullptr);
}

}  // namespace ambrix::tool
