#include "adapters/common/scratch.h"

#include <cstdint>
#include <cstring>
#include <memory>
#include <new>

#include "adapters/common/call_frame.h"
#include "adapters/common/exported_interface.h"
#include "adapters/common/host_errors.h"

namespace ambrix {
namespace {

/// Stands in front of the bytes that the module gets.
struct alignas(std::max_align_t) ScratchHead : Tracked {};

}  // namespace

char* copyForModule(std::string_view bytes) {
  auto* const copy = static_cast<char*>(qvMalloc(bytes.size() + 1));
  if (!bytes.empty()) std::memcpy(copy, bytes.data(), bytes.size());
  copy[bytes.size()] = '\0';
  return copy;
}

void reclaimScratch(Tracked& buffer) noexcept {
  auto* const head = static_cast<ScratchHead*>(&buffer);
  std::destroy_at(head);  // which takes it off its list
  releaseScratch(head);
}

}  // namespace ambrix

void* qvMalloc(std::size_t bytes) {
  using ambrix::ScratchHead;
  if (bytes > PTRDIFF_MAX - sizeof(ScratchHead)) ambrix::raiseOutOfMemory();
  auto* const head = new (ambrix::allocateScratch(sizeof(ScratchHead), bytes)) ScratchHead;
  if (auto* const frame = ambrix::CallFrame::current()) frame->trackScratch(*head);
  return head + 1;
}

void qvFree(void* memory) {
  if (memory != nullptr) ambrix::reclaimScratch(*(static_cast<ambrix::ScratchHead*>(memory) - 1));
}
