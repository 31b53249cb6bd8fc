// From results of the module to Python's objects.
#pragma once

#include <nanobind/nanobind.h>

#include <cstddef>

#include "ambrix/embedded.h"
#include "src/rows.h"

namespace ambrix::python {

/// Converts a result, whose memory goes with it where it is large. `counts` is the number of counts
/// that a block was asked for by.
nanobind::object convertResult(ResultKind kind, Array&& result, std::size_t counts);

}  // namespace ambrix::python
