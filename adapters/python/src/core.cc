// The extension `ambrix._core`.
#include <nanobind/nanobind.h>
#include <nanobind/stl/string.h>

#include <string>

#include "ambrix/file_error.h"
#include "ambrix_version.h"
#include "src/library.h"
#include "src/messages.h"
#include "src/open_file.h"
#include "src/startup.h"
#include "src/times.h"

/// What inflates for the CDF library, if it is not its own zlib.
extern "C" [[gnu::weak]] const char* ambrixInflater();

namespace nb = nanobind;

namespace ambrix::python {
namespace {

nb::tuple leakCounts() {
  const LiveCounts counts = leaks();
  return nb::make_tuple(counts.arrays, counts.scratch);
}

std::string inflater() {
  return ambrixInflater == nullptr ? "CDF library" : ambrixInflater();
}

}  // namespace

NB_MODULE(_core, module) {
  nb::register_exception_translator([](const std::exception_ptr& failure, void*) {
    try {
      std::rethrow_exception(failure);
    } catch (const Error&) {
      setErrorFromException();
    } catch (const FileError&) {
      setErrorFromException();
    }
  });
  importNumpy();
  startLibrary();
  module.attr("__version__") = nb::str(kAmbrixVersion);
  module.attr("commands") = makeCommands();
  bindOpenFile(module);
  bindTimes(module);
  module.def("inflater", inflater,
             "What inflates compressed values: \"ISA-L\" or \"CDF library\".");
  module.def("leaks", leakCounts,
             "How many arrays and buffers calls have left behind: none, or there is a fault.");
  module.def("unload", unloadLibrary, "Closes all files and lets the module go.");
}

}  // namespace ambrix::python
