#include "tests/inflate/guarded_bytes.h"

#include <sys/mman.h>
#include <unistd.h>

#include <new>

namespace ambrix_test {

GuardedBytes::GuardedBytes(std::size_t size) {
  const auto page = static_cast<std::size_t>(sysconf(_SC_PAGESIZE));
  const std::size_t usable = (size + page - 1) / page * page;
  mapped_ = usable + page;
  start_ = mmap(nullptr, mapped_, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
  if (start_ == MAP_FAILED) throw std::bad_alloc();
  end_ = static_cast<unsigned char*>(start_) + usable;
  mprotect(end_, page, PROT_NONE);
}

GuardedBytes::~GuardedBytes() {
  munmap(start_, mapped_);
}

}  // namespace ambrix_test
