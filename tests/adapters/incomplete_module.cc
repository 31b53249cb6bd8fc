// What a host must not take for a module: the version is missing, or a function it calls is.
#include "host/qvh.h"

extern "C" void functionOfNoHost();

extern "C" [[gnu::visibility("default")]] void qvhFunction(int, qvArray*[], int, const qvArray*[]) {
#ifdef CALL_UNKNOWN_FUNCTION
  functionOfNoHost();
#endif
}
