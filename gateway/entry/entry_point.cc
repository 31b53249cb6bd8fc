// The two functions that the module exports, and the one for hosts that are linked with it.
#include <boost/numeric/conversion/cast.hpp>
#include <cstdint>
#include <string>

#include "file/file_lifecycle.h"
#include "gateway/arguments.h"
#include "gateway/entry/command_table.h"
#include "gateway/errors.h"
#include "gateway/raise_error.h"
#include "host/qvh.h"

namespace {

using namespace TOLVEX::ambrix;

void runHandler(const CommandEntry& entry, int outputCount, qvArray* outputs[],
                std::int32_t argumentCount, const qvArray* inputs[]) {
  try {
    entry.handler(outputCount, outputs, argumentCount, inputs + 1, &entry);
    return;
  } catch (const boost::numeric::bad_numeric_cast&) {
    // Raised below, outside the handler that would keep the caught exception alive.
  }
  raiseError(validate::argumentOutOfBounds());
}

}  // namespace

extern "C" [[gnu::visibility("default")]] void qvhFunction(int outputCount, qvArray* outputs[],
                                                           int inputCount,
                                                           const qvArray* inputs[]) {
  qvhAtExit(closeAllOnUnload);
  const std::string name = getStringArg(inputs[0]);
  const std::int32_t argumentCount = inputCount - 1;
  const CommandEntry& entry = lookupCommand(name, argumentCount);
  runHandler(entry, outputCount, outputs, argumentCount, inputs);
}

extern "C" [[gnu::visibility("default")]] void qvhfilerequiredapiversion(
    std::uint32_t* releaseCode, std::uint32_t* apiVersion) {
  *releaseCode = qvhReleaseCode;
  *apiVersion = qvhApiVersion;
}

extern "C" void qvhAbandonFile(std::uint64_t file) {
  abandonFile(CdfId{file});
}
