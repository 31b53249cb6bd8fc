// The texts of messages, which are the same in all hosts.
#include "adapters/catalogue/message_catalogue.h"
#include "adapters/common/exported_interface.h"

void qvGetMessageText(const TOLVEX::ambrix::MessageId& id, std::string& text) {
  text = ambrix::catalogue::messageText(id);
}
