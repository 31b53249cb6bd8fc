#include "adapters/embedded/call_frame.h"

#include "adapters/embedded/scratch.h"

namespace ambrix {
namespace {

thread_local CallFrame* innermost = nullptr;

}  // namespace

CallFrame::CallFrame(ModuleRecord& record) noexcept : record_(record), outer_(innermost) {
  innermost = this;
  ++record_.depth;
}

CallFrame::~CallFrame() {
  while (Tracked* const place = arrays_.takeFirst()) {
    destroyArray(reinterpret_cast<qvArray*>(place));
  }
  while (Tracked* const place = scratch_.takeFirst())
    freeScratchAt(*place);
  --record_.depth;
  innermost = outer_;
}

CallFrame* CallFrame::current() noexcept {
  return innermost;
}

}  // namespace ambrix

// Outside any call there is no module that could be unloaded, and nobody who asked for warnings.

void qvhAtExit(qvhExitHandler handler) {
  if (ambrix::CallFrame* const frame = ambrix::CallFrame::current()) {
    frame->record().exitHandler = handler;
  }
}

void qvWarningMsgId(const TOLVEX::ambrix::MessageId& id) {
  ambrix::CallFrame* const frame = ambrix::CallFrame::current();
  if (frame == nullptr) return;
  ambrix::ModuleRecord& record = frame->record();
  if (!record.warningHandler) {
    record.warnings.push_back(id);
    return;
  }
  try {
    record.warningHandler(id);
  } catch (...) {
    // The unload handler has files to close after its warning, whatever becomes of that.
    if (!record.unloading) throw;
  }
}
