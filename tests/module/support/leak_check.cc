#include "tests/module/support/leak_check.h"

#ifdef __SANITIZE_ADDRESS__

#include <sanitizer/lsan_interface.h>

namespace ambrix_test {

LeaksIgnored::LeaksIgnored() {
  __lsan_disable();
}
LeaksIgnored::~LeaksIgnored() {
  __lsan_enable();
}

}  // namespace ambrix_test

#else

namespace ambrix_test {

LeaksIgnored::LeaksIgnored() = default;
LeaksIgnored::~LeaksIgnored() = default;

}  // namespace ambrix_test

#endif
