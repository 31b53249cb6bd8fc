// What a call has made and not yet handed over: lists that are threaded through the objects.
#pragma once

#include <cstddef>

namespace ambrix {

class TrackedList;

/// The place of an object in at most one list.
struct Tracked {
  Tracked* previous = nullptr;
  Tracked* next = nullptr;
  TrackedList* list = nullptr;
};

/// A list of objects that it does not own. Adding and removing take constant time.
class TrackedList {
 public:
  TrackedList() noexcept { ends_.previous = ends_.next = &ends_; }
  TrackedList(const TrackedList&) = delete;
  TrackedList& operator=(const TrackedList&) = delete;

  void add(Tracked& object) noexcept {
    object = {ends_.previous, &ends_, this};
    ends_.previous->next = &object;
    ends_.previous = &object;
    ++size_;
  }

  /// Takes the object off the list that it is on, if any.
  static void remove(Tracked& object) noexcept {
    if (object.list == nullptr) return;
    object.previous->next = object.next;
    object.next->previous = object.previous;
    --object.list->size_;
    object = {};
  }

  [[nodiscard]] std::size_t size() const noexcept { return size_; }

  /// Takes the oldest object off the list; null when the list is empty.
  Tracked* takeFirst() noexcept {
    if (size_ == 0) return nullptr;
    Tracked* const first = ends_.next;
    remove(*first);
    return first;
  }

 private:
  Tracked ends_;
  std::size_t size_ = 0;
};

}  // namespace ambrix
