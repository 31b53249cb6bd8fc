// One call of the module, from its start until everything it made is handed over or reclaimed.
#pragma once

#include <boost/intrusive/list.hpp>
#include <cstddef>
#include <forward_list>
#include <span>

#include "adapters/octave/octave_array.h"

namespace ambrix::octave_host {

/// Stands in front of each temporary buffer of the module. It leaves its list when it is freed.
struct alignas(std::max_align_t) ScratchHead
    : boost::intrusive::list_base_hook<boost::intrusive::link_mode<boost::intrusive::auto_unlink>> {
};

/// Owns what the module makes while it lives. Frames nest when a warning stops in the debugger and
/// its user calls the module from there.
class CallFrame {
 public:
  CallFrame() noexcept;
  CallFrame(const CallFrame&) = delete;
  CallFrame& operator=(const CallFrame&) = delete;
  ~CallFrame();

  /// The innermost frame; null outside any call.
  static CallFrame* current() noexcept;

  qvArray* make(qvClassID classId, std::span<const std::size_t> sizes, Content content) {
    return &arrays_.emplace_front(classId, sizes, content);
  }
  void reclaimLater(ScratchHead& buffer) noexcept { scratch_.push_back(buffer); }

 private:
  CallFrame* outer_;
  std::forward_list<qvArray> arrays_;
  boost::intrusive::list<ScratchHead, boost::intrusive::constant_time_size<false>> scratch_;
};

}  // namespace ambrix::octave_host
