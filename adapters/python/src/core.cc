// The extension `ambrix._core`.
#include <nanobind/nanobind.h>

#include "ambrix_version.h"
#include "src/library.h"
#include "src/messages.h"
#include "src/startup.h"

namespace nb = nanobind;

namespace ambrix::python {
namespace {

nb::tuple leakCounts() {
  const LiveCounts counts = leaks();
  return nb::make_tuple(counts.arrays, counts.scratch);
}

}  // namespace

NB_MODULE(_core, module) {
  nb::register_exception_translator([](const std::exception_ptr& failure, void*) {
    try {
      std::rethrow_exception(failure);
    } catch (const Error&) {
      setErrorFromException();
    }
  });
  importNumpy();
  startLibrary();
  module.attr("__version__") = nb::str(kAmbrixVersion);
  module.attr("commands") = makeCommands();
  module.def("leaks", leakCounts,
             "How many arrays and buffers calls have left behind: none, or there is a fault.");
  module.def("unload", unloadLibrary, "Closes all files and lets the module go.");
}

}  // namespace ambrix::python
