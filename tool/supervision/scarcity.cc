#include "tool/supervision/scarcity.h"

#include <fcntl.h>
#include <sys/mman.h>
#include <unistd.h>

#include <array>
#include <csignal>
#include <cstddef>
#include <string>

#include "tool/supervision/steps.h"

namespace ambrix::tool {
namespace {

constexpr Scarcity kDescriptors = {"ambrix:outOfDescriptors",
                                   "no more files can be opened: 'ulimit -n' may allow more"};
constexpr Scarcity kMemory = {
    "ambrix:outOfMemory",
    "there is too little memory: --memory-limit or 'ulimit -v' may allow more"};

/// The file and what the library opens beside it for a while.
constexpr int kDescriptorsNeeded = 6;
/// What the library takes for a file of moderate size, with its caches.
constexpr std::size_t kMemoryNeeded = 64 << 20;

bool canOpenFiles() noexcept {
  std::array<int, kDescriptorsNeeded> opened{};
  for (int& descriptor : opened)
    descriptor = ::open("/dev/null", O_RDONLY | O_CLOEXEC);
  const bool enough = opened.back() >= 0;
  for (const int descriptor : opened)
    if (descriptor >= 0) ::close(descriptor);
  return enough;
}

bool canHaveMemory() noexcept {
  void* const memory =
      ::mmap(nullptr, kMemoryNeeded, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
  if (memory == MAP_FAILED) return false;
  ::munmap(memory, kMemoryNeeded);
  return true;
}

/// What a crashing process tells: nothing can be allocated then.
std::array<std::string, 2>& lastWords() {
  static std::array<std::string, 2> lines = {unreadFinding(problemOf(kDescriptors)),
                                             unreadFinding(problemOf(kMemory))};
  return lines;
}

void reportAndCrash(int signal) {
  if (const Scarcity* scarcity = findScarcity())
    report(lastWords().at(scarcity == &kMemory ? 1 : 0));
  std::raise(signal);  // the handler is gone
}

/// A stack of its own, because the usual one may be what has run out.
void useOtherStack() {
  static std::array<std::byte, 1 << 16> room;
  stack_t stack = {};
  stack.ss_sp = room.data();
  stack.ss_size = room.size();
  ::sigaltstack(&stack, nullptr);
}

}  // namespace

const Scarcity* findScarcity() noexcept {
  if (!canOpenFiles()) return &kDescriptors;
  return canHaveMemory() ? nullptr : &kMemory;
}

Problem problemOf(const Scarcity& scarcity) {
  return {"", scarcity.identifier, scarcity.message};
}

void reportScarcityInCrashes() {
  lastWords();
  useOtherStack();
  struct sigaction action = {};
  action.sa_handler = reportAndCrash;
  action.sa_flags = static_cast<int>(SA_ONSTACK | SA_RESETHAND | SA_NODEFER);
  for (const int signal : {SIGSEGV, SIGBUS, SIGABRT, SIGFPE, SIGILL})
    ::sigaction(signal, &action, nullptr);
}

}  // namespace ambrix::tool
