#include "ambrix/error.h"

#include <mutex>

#include "adapters/catalogue/message_catalogue.h"

namespace ambrix {

struct Error::Content {
  explicit Content(const MessageId& from) : id(from), identifier(from.fullIdentifier()) {}

  /// Made when it is first asked for: programs handle most errors by their identifiers.
  const char* text() const noexcept {
    try {
      std::call_once(textMade, [this] { madeText = catalogue::messageText(id); });
      return madeText.c_str();
    } catch (...) {
      return identifier.c_str();
    }
  }

  MessageId id;
  std::string identifier;
  mutable std::once_flag textMade;
  mutable std::string madeText;
};

Error::Error(const MessageId& id) : content_(std::make_shared<const Content>(id)) {}
Error::~Error() = default;

const char* Error::what() const noexcept {
  return content_->text();
}
const std::string& Error::identifier() const noexcept {
  return content_->identifier;
}
const std::vector<MessageArg>& Error::values() const noexcept {
  return content_->id.values;
}
const MessageId& Error::id() const noexcept {
  return content_->id;
}

LoadError::~LoadError() = default;

std::string messageText(const MessageId& id) {
  return catalogue::messageText(id);
}

}  // namespace ambrix
