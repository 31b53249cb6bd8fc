#include "adapters/octave/call_frame.h"

#include <cstdint>
#include <cstdlib>

#include "adapters/octave/host_errors.h"

namespace ambrix::octave_host {
namespace {

CallFrame* innermost = nullptr;

void release(ScratchHead* buffer) {
  buffer->~ScratchHead();
  std::free(buffer);
}

}  // namespace

CallFrame::CallFrame() noexcept : outer_(innermost) {
  innermost = this;
}

CallFrame::~CallFrame() {
  scratch_.clear_and_dispose(release);
  innermost = outer_;
}

CallFrame* CallFrame::current() noexcept {
  return innermost;
}

}  // namespace ambrix::octave_host

using ambrix::octave_host::CallFrame;
using ambrix::octave_host::ScratchHead;

void* qvMalloc(std::size_t bytes) {
  if (bytes > PTRDIFF_MAX - sizeof(ScratchHead)) ambrix::octave_host::raiseOutOfMemory();
  void* const block = std::malloc(sizeof(ScratchHead) + bytes);
  if (block == nullptr) ambrix::octave_host::raiseOutOfMemory();
  auto* const head = new (block) ScratchHead;
  if (CallFrame* const frame = CallFrame::current()) frame->reclaimLater(*head);
  return head + 1;
}

void qvFree(void* memory) {
  if (memory != nullptr) ambrix::octave_host::release(static_cast<ScratchHead*>(memory) - 1);
}
