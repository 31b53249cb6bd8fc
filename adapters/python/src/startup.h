// What is done once, when the extension is loaded.
#pragma once

#include <nanobind/nanobind.h>

namespace ambrix::python {

/// Loads NumPy's C interface.
void importNumpy();

/// The functions of the commands, as members of a module of their own.
nanobind::object makeCommands();

}  // namespace ambrix::python
