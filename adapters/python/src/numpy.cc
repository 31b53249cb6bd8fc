#define AMBRIX_IMPORTS_NUMPY
#include "src/numpy.h"

#include "src/startup.h"

namespace nb = nanobind;

namespace ambrix::python {

void importNumpy() {
  if (PyArray_ImportNumPyAPI() != 0) throw nb::python_error();
}

nb::object orThrow(PyObject* made) {
  if (made == nullptr) throw nb::python_error();
  return nb::steal(made);
}

int numpyTypeOf(ClassId classId) {
  switch (classId) {
    case ClassId::kLogical:
      return NPY_BOOL;
    case ClassId::kDouble:
      return NPY_DOUBLE;
    case ClassId::kSingle:
      return NPY_FLOAT;
    case ClassId::kInt8:
      return NPY_INT8;
    case ClassId::kUint8:
      return NPY_UINT8;
    case ClassId::kInt16:
      return NPY_INT16;
    case ClassId::kUint16:
      return NPY_UINT16;
    case ClassId::kInt32:
      return NPY_INT32;
    case ClassId::kUint32:
      return NPY_UINT32;
    case ClassId::kInt64:
      return NPY_INT64;
    case ClassId::kUint64:
      return NPY_UINT64;
    case ClassId::kUnknown:
    case ClassId::kCell:
    case ClassId::kChar:
      break;
  }
  return NPY_NOTYPE;
}

std::optional<ClassId> classOf(PyArrayObject* array) {
  const char kind = PyArray_DESCR(array)->kind;
  const npy_intp bytes = PyArray_ITEMSIZE(array);
  if (kind == 'b') return ClassId::kLogical;
  if (kind == 'f' && bytes == 8) return ClassId::kDouble;
  if (kind == 'f' && bytes == 4) return ClassId::kSingle;
  if (kind != 'i' && kind != 'u') return std::nullopt;
  const bool isSigned = kind == 'i';
  switch (bytes) {
    case 1:
      return isSigned ? ClassId::kInt8 : ClassId::kUint8;
    case 2:
      return isSigned ? ClassId::kInt16 : ClassId::kUint16;
    case 4:
      return isSigned ? ClassId::kInt32 : ClassId::kUint32;
    case 8:
      return isSigned ? ClassId::kInt64 : ClassId::kUint64;
    default:
      return std::nullopt;
  }
}

nb::object inModuleOrder(nb::handle value, int type) {
  constexpr int kWanted = NPY_ARRAY_F_CONTIGUOUS | NPY_ARRAY_ALIGNED | NPY_ARRAY_NOTSWAPPED;
  if (type == NPY_NOTYPE && isArray(value) && PyArray_CHKFLAGS(arrayOf(value), kWanted) &&
      PyArray_ISNOTSWAPPED(arrayOf(value))) {
    return nb::borrow(value);
  }
  PyArray_Descr* const wanted = type == NPY_NOTYPE ? nullptr : PyArray_DescrFromType(type);
  return orThrow(PyArray_CheckFromAny(value.ptr(), wanted, 0, 0, kWanted, nullptr));
}

}  // namespace ambrix::python
