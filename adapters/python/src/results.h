// From results of the module to Python's objects.
#pragma once

#include <nanobind/nanobind.h>

#include <cstddef>

#include "ambrix/embedded.h"
#include "src/rows.h"

namespace ambrix::python {

/// Converts a result, whose memory goes with it where it is large. A block has so many dimensions,
/// with the characters of texts and the two numbers of EPOCH16 as the first.
nanobind::object convertResult(ResultKind kind, Array&& result, std::size_t dimensions = 0);

}  // namespace ambrix::python
