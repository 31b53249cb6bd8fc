// What a call may throw, and the messages that errors and warnings carry.
#pragma once

#include <exception>
#include <memory>
#include <stdexcept>
#include <string>
#include <vector>

#include "ambrix/export.h"
#include "host/message_id.h"

namespace ambrix {

using TOLVEX::ambrix::MessageArg;
using TOLVEX::ambrix::MessageId;

/// The text of a message: a sentence with the message's values in it. Narrow values are taken over
/// byte by byte, UTF-16 values become UTF-8.
AMBRIX_EXPORT std::string messageText(const MessageId& id);

/// An error that the module has raised, or the host itself ("TOLVEX:host:badDimension" and
/// "TOLVEX:host:outOfMemory"). `what()` is the message text.
class AMBRIX_EXPORT Error : public std::exception {
 public:
  explicit Error(const MessageId& id);
  ~Error() override;

  [[nodiscard]] const char* what() const noexcept override;
  /// For example "TOLVEX:ambrix:cdflib:libraryFailure".
  [[nodiscard]] const std::string& identifier() const noexcept;
  [[nodiscard]] const std::vector<MessageArg>& values() const noexcept;
  [[nodiscard]] const MessageId& id() const noexcept;

 private:
  struct Content;
  std::shared_ptr<const Content> content_;  // copies of an exception must not throw
};

/// A module that cannot be loaded; `what()` tells which and why.
class AMBRIX_EXPORT LoadError : public std::runtime_error {
 public:
  using std::runtime_error::runtime_error;
  ~LoadError() override;
};

}  // namespace ambrix
