#include "adapters/common/call_frame.h"

#include "adapters/common/scratch.h"

namespace ambrix {
namespace {

thread_local CallFrame* innermost = nullptr;

}  // namespace

CallFrame::CallFrame() noexcept : outer_(innermost) {
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
