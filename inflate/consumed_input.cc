#include "inflate/consumed_input.h"

#include <new>

namespace ambrix::inflate {

void ConsumedInput::append(Bytes input) noexcept {
  if (!complete_) return;
  try {
    complete_ = input.size() <= kMost - bytes_.size();
    if (complete_) bytes_.insert(bytes_.end(), input.begin(), input.end());
  } catch (const std::bad_alloc&) {
    complete_ = false;
  }
  if (!complete_) bytes_ = {};
}

}  // namespace ambrix::inflate
