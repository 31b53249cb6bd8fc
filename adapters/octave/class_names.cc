#include "adapters/octave/class_names.h"

#include <string>

namespace ambrix::octave_host {
namespace {

struct ClassName {
  qvClassID classId;
  const char* name;
};

constexpr ClassName kClassNames[] = {
    {qvDOUBLE_CLASS, "double"},   {qvSINGLE_CLASS, "single"}, {qvCHAR_CLASS, "char"},
    {qvLOGICAL_CLASS, "logical"}, {qvCELL_CLASS, "cell"},     {qvSTRUCT_CLASS, "struct"},
    {qvINT8_CLASS, "int8"},       {qvUINT8_CLASS, "uint8"},   {qvINT16_CLASS, "int16"},
    {qvUINT16_CLASS, "uint16"},   {qvINT32_CLASS, "int32"},   {qvUINT32_CLASS, "uint32"},
    {qvINT64_CLASS, "int64"},     {qvUINT64_CLASS, "uint64"},
};

/// Ranges, sparse matrices and others that Octave keeps in a form of their own tell only a name.
qvClassID classByName(const octave_value& value) {
  if (value.isobject() || value.isjava()) return qvUNKNOWN_CLASS;
  const std::string name = value.class_name();
  for (const ClassName& entry : kClassNames) {
    if (name == entry.name) return entry.classId;
  }
  return qvUNKNOWN_CLASS;
}

}  // namespace

const char* nameOfClass(qvClassID classId) noexcept {
  for (const ClassName& entry : kClassNames) {
    if (entry.classId == classId) return entry.name;
  }
  return "";
}

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
