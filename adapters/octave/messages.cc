// Errors, warnings and the news that the module is about to be unloaded.
#include <octave/error.h>
#include <octave/interpreter.h>
#include <unistd.h>

#include <cstdlib>
#include <string>
#include <utility>

#include "adapters/catalogue/message_catalogue.h"
#include "host/qvh.h"

namespace {

using TOLVEX::ambrix::MessageId;

qvhExitHandler exitHandler = nullptr;
pid_t process = 0;  // that has loaded the module
bool unloading = false;

/// Octave takes a newline at the end as a wish for no traceback.
std::string textFor(const MessageId& id) {
  std::string text = ambrix::catalogue::messageText(id);
  while (text.ends_with('\n'))
    text.pop_back();
  return text;
}

void warn(const MessageId& id) {
  const std::string identifier = id.fullIdentifier();
  const std::string text = textFor(id);
  warning_with_id(identifier.c_str(), "%s", text.c_str());
}

/// Nothing may leave this: it runs while the oct-file is unloaded or the process ends, and there
/// are files to close after the warning, whatever becomes of that. The children of the process
/// leave them to it.
void runExitHandler() {
  if (getpid() != process) return;
  unloading = true;
  try {
    std::exchange(exitHandler, nullptr)();
  } catch (...) {
    // There is nobody left to tell.
  }
}

}  // namespace

void qvErrMsgId(const MessageId& id) {
  const std::string identifier = id.fullIdentifier();
  const std::string text = textFor(id);
  // Raised through Octave's own function, which gives the error its stack.
  error_with_id(identifier.c_str(), "%s", text.c_str());
}

void qvWarningMsgId(const MessageId& id) {
  if (!unloading) return warn(id);
  if (octave::interpreter::the_interpreter() == nullptr) return;
  try {
    warn(id);
  } catch (...) {
    // Users can have warnings raised as errors, which would keep the files from being closed.
  }
}

// Registered with the C library, which runs the handler when Octave unloads this oct-file and else
// when the process ends, as long as the objects of the file live.
void qvhAtExit(qvhExitHandler handler) {
  exitHandler = handler;
  if (process == 0 && std::atexit(runExitHandler) == 0) process = getpid();
}
