#include "adapters/common/host_errors.h"

#include <cstdlib>

#include "adapters/common/exported_interface.h"

namespace ambrix {
namespace {

[[noreturn]] void raise(const TOLVEX::ambrix::MessageId& id) {
  qvErrMsgId(id);
  std::abort();  // never reached
}

}  // namespace

void raiseBadDimension() {
  raise({"TOLVEX:host", "badDimension"});
}
void raiseOutOfMemory() {
  raise({"TOLVEX:host", "outOfMemory"});
}
void raiseUnexpected(const char* text) {
  raise({"TOLVEX:host", "unexpectedFailure", {std::string(text)}});
}

}  // namespace ambrix
