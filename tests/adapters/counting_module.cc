// A module to load: it counts its calls in a static variable, and its unloading in one of the host.
#include <cstdint>

#include "host/qvh.h"

#ifndef RELEASE_CODE
#define RELEASE_CODE qvhReleaseCode
#endif
#ifndef API_VERSION
#define API_VERSION qvhApiVersion
#endif

namespace {

int calls = 0;
int* unloadings = nullptr;

void countUnloading() {
  if (unloadings != nullptr) ++*unloadings;
  qvWarningMsgId(TOLVEX::ambrix::MessageId("TEST:module", "unloading", {calls}));
}

}  // namespace

/// "calls" gives the number of calls until now; with a uint64 address of an int, that counts the
/// unloadings from then on. Any other command is an error with the command as its value.
extern "C" [[gnu::visibility("default")]] void qvhFunction(int, qvArray* outputs[], int inputCount,
                                                           const qvArray* inputs[]) {
  qvhAtExit(countUnloading);
  ++calls;
  char* const command = qvArrayToString(inputs[0]);
  const std::string name = command == nullptr ? "" : command;
  qvFree(command);
  if (name != "calls") {
    qvErrMsgId(TOLVEX::ambrix::MessageId("TEST:module", "noSuchCommand", {name}));
  }
  if (inputCount > 1) unloadings = *static_cast<int* const*>(qvGetReadOnlyData(inputs[1]));
  outputs[0] = qvCreateDoubleScalar(calls);
}

extern "C" [[gnu::visibility("default")]] void qvhfilerequiredapiversion(
    std::uint32_t* releaseCode, std::uint32_t* apiVersion) {
  *releaseCode = RELEASE_CODE;
  *apiVersion = API_VERSION;
}
