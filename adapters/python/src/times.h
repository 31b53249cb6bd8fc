// Times of CDF files as NumPy has them.
#pragma once

#include <nanobind/nanobind.h>

namespace ambrix::python {

/// Adds the conversions to the extension.
void bindTimes(nanobind::module_& module);

}  // namespace ambrix::python
