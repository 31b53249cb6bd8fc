// The memory of an array's elements, in the hands of a caller.
#pragma once

#include <memory>

#include "ambrix/export.h"

struct qvArray;

namespace ambrix {

/// Frees elements that an array has given up, on any thread.
class AMBRIX_EXPORT FreeElements {
 public:
  FreeElements() noexcept = default;
  void operator()(void* elements) const noexcept;

 private:
  friend class Array;
  explicit FreeElements(qvArray* array) noexcept : array_(array) {}

  qvArray* array_ = nullptr;  // what is left of the array; it holds the memory
};

/// Elements that their holder may read, write and keep as long as it likes. `std::shared_ptr<void>`
/// takes them over as they are.
using OwnedElements = std::unique_ptr<void, FreeElements>;

}  // namespace ambrix
