// How a typed error leaves the module.
#pragma once

#include <exception>
#include <memory>
#include <string>
#include <utility>

#include "host/message_id.h"

namespace TOLVEX::ambrix {

/// A raised error as a standard exception that can be carried, copied and thrown again unchanged.
class RaisedError final : public std::exception {
 public:
  explicit RaisedError(MessageId id) : id_(std::move(id)) {}

  [[nodiscard]] const MessageId& messageId() const { return id_; }
  [[nodiscard]] std::string identifier() const { return id_.fullIdentifier(); }
  /// The text of the host's message catalogue with the values filled in.
  [[nodiscard]] const char* what() const noexcept override;
  [[nodiscard]] std::unique_ptr<RaisedError> clone() const;
  [[noreturn]] void rethrow() const;

 private:
  MessageId id_;
  mutable std::string text_;  // filled when it is first asked for
};

/// Hands the error to the host, which reports it and does not return; should it come back, the
/// error is thrown as a `RaisedError` instead.
[[noreturn]] void raiseError(MessageId error);

}  // namespace TOLVEX::ambrix
