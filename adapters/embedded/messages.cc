// Errors, warnings and the wish to be told of the unloading.
#include "adapters/common/exported_interface.h"
#include "adapters/embedded/module_frame.h"
#include "ambrix/error.h"

using ambrix::ModuleFrame;
using ambrix::ModuleRecord;
using TOLVEX::ambrix::MessageId;

void qvErrMsgId(const MessageId& id) {
  throw ambrix::Error(id);
}

// Outside any call there is no module that could be unloaded, and nobody who asked for warnings.

void qvWarningMsgId(const MessageId& id) {
  ModuleRecord* const record = ModuleFrame::currentRecord();
  if (record == nullptr) return;
  if (!record->warningHandler) {
    record->warnings.push_back(id);
    return;
  }
  try {
    record->warningHandler(id);
  } catch (...) {
    // The unload handler has files to close after its warning, whatever becomes of that.
    if (!record->unloading) throw;
  }
}

void qvhAtExit(qvhExitHandler handler) {
  if (ModuleRecord* const record = ModuleFrame::currentRecord()) record->exitHandler = handler;
}
