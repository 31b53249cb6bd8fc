#include "fuzz/calls/mode.h"

namespace ambrix_fuzz {
namespace {

bool extended = false;

}  // namespace

bool isExtended() {
  return extended;
}

void setExtended(bool offered) {
  extended = offered;
}

}  // namespace ambrix_fuzz
