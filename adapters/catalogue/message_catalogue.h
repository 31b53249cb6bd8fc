// What people read when the module raises an error or issues a warning.
#pragma once

#include <string>

#include "host/message_id.h"

namespace ambrix::catalogue {

/// The text of a message with its values filled in. Narrow values are taken over byte by byte,
/// UTF-16 values become UTF-8. Any values are accepted: one that the text asks for and the message
/// lacks shows as "?", further ones are left out. A message without a text of its own gives its
/// identifier and values.
std::string messageText(const TOLVEX::ambrix::MessageId& id);

}  // namespace ambrix::catalogue
