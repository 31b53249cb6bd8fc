// NumPy's C interface and the element types of the module in it.
#pragma once

#include <nanobind/nanobind.h>

#include <optional>

#define NPY_NO_DEPRECATED_API NPY_1_22_API_VERSION
#define PY_ARRAY_UNIQUE_SYMBOL ambrixNumpyApi
#ifndef AMBRIX_IMPORTS_NUMPY
#define NO_IMPORT_ARRAY
#endif
#include <numpy/arrayobject.h>

#include "ambrix/embedded.h"

namespace ambrix::python {

inline bool isArray(nanobind::handle object) {
  return PyArray_Check(object.ptr());
}
inline PyArrayObject* arrayOf(nanobind::handle object) {
  return reinterpret_cast<PyArrayObject*>(object.ptr());
}

/// The array or what else NumPy has made. Throws nanobind::python_error when it has failed.
nanobind::object orThrow(PyObject* made);

/// NumPy's number for the type of elements; characters and cells have none.
int numpyTypeOf(ClassId classId);

/// The class of an array's elements; none when the module has no such class.
std::optional<ClassId> classOf(PyArrayObject* array);

/// The array in the order, alignment and byte order of the module: itself when it is so already.
/// The type is one of NumPy's numbers, or NPY_NOTYPE for any.
nanobind::object inModuleOrder(nanobind::handle value, int type = NPY_NOTYPE);

}  // namespace ambrix::python
