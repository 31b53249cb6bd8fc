#include "tool/output/warnings.h"

#include <cstdio>

#include "tool/output/text.h"

namespace ambrix::tool {

void printWarning(const MessageId& id) {
  std::fprintf(stderr, "ambrix: warning: %s: %s\n", id.fullIdentifier().c_str(),
               printable(messageText(id)).c_str());
}

}  // namespace ambrix::tool
