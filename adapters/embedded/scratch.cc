#include "adapters/embedded/scratch.h"

#include <limits>
#include <new>

#include "adapters/embedded/allocation.h"
#include "adapters/embedded/call_frame.h"
#include "adapters/embedded/host_errors.h"

namespace ambrix {
namespace {

/// Stands in front of the bytes that the module gets.
struct alignas(std::max_align_t) ScratchHead {
  Tracked place;
};

}  // namespace

void* makeScratch(std::size_t bytes) {
  requireWithinLimit(bytes);
  if (bytes > std::numeric_limits<std::size_t>::max() - sizeof(ScratchHead)) raiseOutOfMemory();
  auto* const head = new (allocate(sizeof(ScratchHead) + bytes)) ScratchHead;
  countScratch(1);
  if (CallFrame* const frame = CallFrame::current()) frame->trackScratch(head->place);
  return head + 1;
}

void freeScratch(void* memory) noexcept {
  if (memory != nullptr) freeScratchAt((static_cast<ScratchHead*>(memory) - 1)->place);
}

void freeScratchAt(Tracked& place) noexcept {
  TrackedList::remove(place);
  release(&place);
  countScratch(-1);
}

}  // namespace ambrix
