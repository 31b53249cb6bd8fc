// The identifiers of the files that the module has opened or created and not yet closed or deleted.
#pragma once

#include <sys/types.h>

#include <algorithm>
#include <cstddef>
#include <vector>

#include "gateway/cdf_id.h"
#include "host/qv.h"

namespace TOLVEX::ambrix {

/// A plain set, not synchronised: the host calls from one thread at a time.
class OpenFileRegistry {
 public:
  /// Makes room for one more file, so that the next `insert` takes no memory.
  void reserve();
  /// Registers an identifier that the library has just handed out, which makes it usable (again).
  void insert(CdfId file);
  void erase(CdfId file);
  /// Forgets all files and gives its memory back.
  void clear();
  [[nodiscard]] bool contains(CdfId file) const { return std::ranges::binary_search(open_, file); }
  [[nodiscard]] std::size_t size() const { return open_.size(); }

  /// Notes that the library has freed a registered file although its identifier stays. Takes no
  /// memory.
  void markFreed(CdfId file);
  [[nodiscard]] bool isFreed(CdfId file) const {
    return !freed_.empty() && std::ranges::binary_search(freed_, file);
  }

  /// Notes that records may wait in the library to be written to a registered file. Takes no
  /// memory.
  void markWritten(CdfId file);
  [[nodiscard]] bool isWritten(CdfId file) const {
    return !written_.empty() && std::ranges::binary_search(written_, file);
  }

  /// Whether it was this process that has registered the file, and not one that it is a child of.
  [[nodiscard]] bool isOfThisProcess(CdfId file) const;

  /// In ascending order.
  [[nodiscard]] const std::vector<CdfId>& files() const { return open_; }

 private:
  std::vector<CdfId> open_;
  std::vector<pid_t> openers_;  // of each in open_
  std::vector<CdfId> freed_;    // a part of open_ that must not reach the library
  std::vector<CdfId> written_;  // a part of open_
};

/// Is there before the module's other static objects and after them: a process may end in an order
/// in which the module is unloaded when they are gone already.
OpenFileRegistry& openFileRegistry();

/// Converts the argument "CDFID". Raises `argumentNotUint64Scalar` unless it is one uint64 element,
/// and `invalidFileId` unless it is registered.
CdfId getCdfIdArg(const qvArray* argument);

/// The 1-by-1 uint64 array that carries an identifier to the host.
qvArray* makeCdfIdScalar(CdfId file);

}  // namespace TOLVEX::ambrix
