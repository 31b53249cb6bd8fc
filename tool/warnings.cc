#include "tool/warnings.h"

#include <cstdio>

namespace ambrix::tool {

void printWarning(const MessageId& id) {
  std::fprintf(stderr, "ambrix: warning: %s: %s\n", id.fullIdentifier().c_str(),
               messageText(id).c_str());
}

}  // namespace ambrix::tool
