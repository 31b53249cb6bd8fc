#include "tool/supervision/steps.h"

#include <sys/mman.h>

#include <algorithm>
#include <cerrno>
#include <system_error>

namespace ambrix::tool {
namespace {

/// Of the process that is watched.
Steps::Memory* watched = nullptr;

}  // namespace

void beginStep(std::string_view what) {
  if (watched == nullptr) return;
  const std::size_t length = std::min(what.size(), watched->last.size() - 1);
  *std::copy_n(what.data(), length, watched->last.data()) = '\0';
  ++watched->count;
}

void report(std::string_view line, std::size_t spare) {
  if (watched == nullptr) return;
  if (line.size() + 1 + spare > watched->reports.size() - watched->reportBytes) {
    ++watched->unreported;
    return;
  }
  *std::ranges::copy(line, watched->reports.data() + watched->reportBytes).out = '\n';
  watched->reportBytes += line.size() + 1;
}

Pause::Pause() noexcept {
  if (watched != nullptr) ++watched->pauses;
}

Pause::~Pause() {
  if (watched != nullptr) --watched->pauses;
}

Steps::Steps() {
  void* const memory = ::mmap(nullptr, sizeof(Memory), PROT_READ | PROT_WRITE,
                              MAP_SHARED | MAP_ANONYMOUS, -1, 0);  // zeros
  if (memory == MAP_FAILED) throw std::system_error(errno, std::generic_category(), "mmap");
  memory_ = static_cast<Memory*>(memory);
}

Steps::~Steps() {
  ::munmap(memory_, sizeof(Memory));
}

void Steps::adopt() const noexcept {
  watched = memory_;
}

void Steps::finish() const noexcept {
  memory_->finished = true;
}

bool Steps::finished() const noexcept {
  return memory_->finished;
}

bool Steps::paused() const noexcept {
  return memory_->pauses > 0;
}

std::uint32_t Steps::count() const noexcept {
  return memory_->count;
}

std::string Steps::last() const {
  return memory_->last.data();
}

std::string Steps::reports() const {
  return {memory_->reports.data(), memory_->reportBytes};
}

std::size_t Steps::unreported() const noexcept {
  return memory_->unreported;
}

}  // namespace ambrix::tool
