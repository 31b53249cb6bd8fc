// The errors and warnings of module and hosts, typed by hand: identifiers, kinds and order of
// values. Tests and fuzzers read them here; errors_test.cc compares them with the module's classes,
// and table_test.py with what the sources and the manual name.
#pragma once

#include <string>
#include <vector>

#include "host/message_id.h"

namespace ambrix_test {

struct KnownMessage {
  /// With an example of its values: the integers 7 and 8, the texts "first" and "second".
  TOLVEX::ambrix::MessageId id;
  /// What the text for users must say of them, in this order.
  std::vector<std::string> shown;
};

const std::vector<KnownMessage>& knownMessages();

}  // namespace ambrix_test
