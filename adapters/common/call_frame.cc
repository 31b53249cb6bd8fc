#include "adapters/common/call_frame.h"

#include "adapters/common/exported_interface.h"
#include "adapters/common/scratch.h"

namespace ambrix {
namespace {

thread_local CallFrame* innermost = nullptr;

}  // namespace

CallFrame::CallFrame(bool extended) noexcept : outer_(innermost), extended_(extended) {
  innermost = this;
}

CallFrame::~CallFrame() {
  arrays_.clear_and_dispose([](Tracked* array) { reclaimArray(*array); });
  scratch_.clear_and_dispose([](Tracked* buffer) { reclaimScratch(*buffer); });
  innermost = outer_;
}

CallFrame* CallFrame::current() noexcept {
  return innermost;
}

}  // namespace ambrix

bool qvOffersExtendedDatatypes() {
  const ambrix::CallFrame* const frame = ambrix::CallFrame::current();
  return frame != nullptr && frame->isExtended();
}
