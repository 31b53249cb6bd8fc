// What a file is, as objects of Python.
#pragma once

#include <nanobind/nanobind.h>

#include "ambrix/description.h"

namespace ambrix::python {

/// A tuple of the facts, the variables and the attributes of a file, as `_core.pyi` describes it.
nanobind::object describedInPython(FileDescription&& description);

}  // namespace ambrix::python
