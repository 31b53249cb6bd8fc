#include "gateway/raise_error.h"

#include "host/qv.h"

namespace TOLVEX::ambrix {

const char* RaisedError::what() const noexcept {
  try {
    if (text_.empty()) qvGetMessageText(id_, text_);
    return text_.c_str();
  } catch (...) {
    return id_.identifier.c_str();
  }
}

std::unique_ptr<RaisedError> RaisedError::clone() const {
  return std::make_unique<RaisedError>(*this);
}

void RaisedError::rethrow() const {
  throw *this;
}

void raiseError(MessageId error) {
  const RaisedError raised(std::move(error));
  qvErrMsgId(raised.messageId());
  raised.rethrow();
}

}  // namespace TOLVEX::ambrix
