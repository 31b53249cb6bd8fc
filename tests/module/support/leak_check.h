// What the leak checker must know about the CDF library.
#pragma once

namespace ambrix_test {

/// Memory allocated in the lifetime of this is no leak: for files whose buffers the library never
/// frees. It remembers them, but is unloaded with the module.
class LeaksIgnored {
 public:
  LeaksIgnored();
  ~LeaksIgnored();
  LeaksIgnored(const LeaksIgnored&) = delete;
  LeaksIgnored& operator=(const LeaksIgnored&) = delete;
};

}  // namespace ambrix_test
