// From Python's objects to arguments of the module.
#pragma once

#include <nanobind/nanobind.h>

#include "ambrix/embedded.h"
#include "src/rows.h"

namespace ambrix::python {

/// An argument and the Python object whose memory it borrows, if it does.
struct Converted {
  Array array;
  nanobind::object keeper;
};

/// Converts an argument. What its kind has no rule for is converted by NumPy and left for the
/// module to refuse. Throws nanobind::python_error for what is no array of a class of the module.
Converted convertArgument(ArgumentKind kind, nanobind::handle value);

}  // namespace ambrix::python
