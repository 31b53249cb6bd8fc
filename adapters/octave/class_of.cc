#include "adapters/octave/class_of.h"

#include "adapters/common/class_names.h"

namespace ambrix::octave_host {
namespace {

/// Ranges, sparse matrices and others that Octave keeps in a form of their own tell only a name.
qvClassID classByName(const octave_value& value) {
  if (value.isobject() || value.isjava()) return qvUNKNOWN_CLASS;
  return classNamed(value.class_name());
}

}  // namespace

qvClassID classOf(const octave_value& value) {
  switch (value.builtin_type()) {
    case btyp_double:
    case btyp_complex:
      return qvDOUBLE_CLASS;
    case btyp_float:
    case btyp_float_complex:
      return qvSINGLE_CLASS;
    case btyp_char:
      return qvCHAR_CLASS;
    case btyp_uint64:
      return qvUINT64_CLASS;
    default:
      return classByName(value);
  }
}

}  // namespace ambrix::octave_host
