#include "src/library.h"

#include <nanobind/nanobind.h>
#include <pthread.h>
#include <unistd.h>

#include <exception>
#include <mutex>
#include <stdexcept>
#include <utility>

#include "host/qvh.h"
#include "src/messages.h"

namespace nb = nanobind;

namespace ambrix::python {
namespace {

/// Never destroyed: what is still to be done at the end is done by `unloadLibrary`.
struct Library {
  Module module{&qvhFunction};
  std::vector<MessageId> warnings;  // of the call under way
  // A plain mutex: in a forked child the thread that unlocks it is another one by its number.
  std::mutex mutex;
  pid_t process = getpid();
};

Library* library = nullptr;

/// A fork waits for the call under way, so that the child finds the CDF library between two calls.
void keepForksApart() {
  pthread_atfork([] { library->mutex.lock(); }, [] { library->mutex.unlock(); },
                 [] { library->mutex.unlock(); });
}

struct Outcome {
  std::exception_ptr failure;
  std::vector<MessageId> warnings;
};

Outcome attempt(const std::function<void(Module&)>& work, bool extended) {
  // The lock goes before the GIL comes back: whoever waits for the one may hold the other.
  const nb::gil_scoped_release released;
  const std::scoped_lock lock(library->mutex);
  Outcome outcome;
  try {
    library->module.setExtended(extended);
    work(library->module);
  } catch (...) {
    outcome.failure = std::current_exception();
  }
  outcome.warnings = std::exchange(library->warnings, {});
  return outcome;
}

void finish(const Outcome& outcome) {
  for (const MessageId& warning : outcome.warnings)
    issueWarning(warning);
  if (outcome.failure) std::rethrow_exception(outcome.failure);
}

}  // namespace

void startLibrary() {
  if (library != nullptr) return;
  library = new Library;
  library->module.setWarningHandler(
      [](const MessageId& warning) { library->warnings.push_back(warning); });
  keepForksApart();
}

void withModule(const std::function<void(Module&)>& work) {
  finish(attempt(work, false));
}

void withExtendedModule(const std::function<void(Module&)>& work) {
  finish(attempt(work, true));
}

std::vector<Array> callCommand(ArrayView command, std::span<const ArrayView> arguments) {
  struct Call {
    ArrayView command;
    std::span<const ArrayView> arguments;
    std::vector<Array> results;
  } call{command, arguments, {}};
  // The one reference fits into std::function without an allocation.
  withModule([&call](Module& module) { call.results = module.call(call.command, call.arguments); });
  return std::move(call.results);
}

void unloadLibrary() {
  if (getpid() != library->process) return;
  withModule([](Module& module) { module.unload(); });
}

LiveCounts leaks() {
  const std::scoped_lock lock(library->mutex);
  return library->module.leaks();
}

}  // namespace ambrix::python
