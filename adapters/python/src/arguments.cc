#include "src/arguments.h"

#include <algorithm>
#include <optional>
#include <string_view>
#include <vector>

#include "src/library.h"
#include "src/numpy.h"

namespace nb = nanobind;

namespace ambrix::python {
namespace {

std::string_view bytesOf(nb::handle bytes) {
  return {PyBytes_AsString(bytes.ptr()), static_cast<std::size_t>(PyBytes_Size(bytes.ptr()))};
}

/// The text in an encoding, as `bytes`.
nb::object encoded(nb::handle text, const char* encoding, const char* errors) {
  return orThrow(PyUnicode_AsEncodedString(text.ptr(), encoding, errors));
}

/// One unit for each byte of UTF-8.
Array narrowText(nb::handle text) {
  if (PyBytes_Check(text.ptr())) return Array::fromNarrow(bytesOf(text));
  return Array::fromNarrow(bytesOf(encoded(text, "utf-8", "surrogateescape")));
}

/// One unit for each of UTF-16. Lone surrogates stay, for the module to refuse.
Array wideText(nb::handle text) {
  const nb::object bytes = encoded(text, "utf-16-le", "surrogatepass");
  const std::size_t count = bytesOf(bytes).size() / 2;
  std::u16string units(count, u'\0');
  std::copy_n(bytesOf(bytes).data(), 2 * count, reinterpret_cast<char*>(units.data()));
  return Array::text(units);
}

bool isText(nb::handle value) {
  return PyUnicode_Check(value.ptr()) || PyBytes_Check(value.ptr());
}

Converted fileName(nb::handle value) {
  const nb::object path = orThrow(PyOS_FSPath(value.ptr()));
  if (PyUnicode_Check(path.ptr())) return {wideText(path), {}};
  return {narrowText(path), {}};
}

/// Texts of one length: their characters become the first dimension.
Converted texts(PyArrayObject* array) {
  const auto length = static_cast<std::size_t>(PyArray_ITEMSIZE(array));
  std::vector<std::size_t> sizes{length};
  sizes.insert(sizes.end(), PyArray_DIMS(array), PyArray_DIMS(array) + PyArray_NDIM(array));
  Array chars = Array::uninitialized(ClassId::kChar, sizes);
  const auto* const bytes = static_cast<const unsigned char*>(PyArray_DATA(array));
  std::copy_n(bytes, chars.elementCount(), chars.mutableData<char16_t>().data());
  return {std::move(chars), {}};
}

[[noreturn]] void refuseType(PyArrayObject* array) {
  const nb::object type = nb::borrow(reinterpret_cast<PyObject*>(PyArray_DESCR(array)));
  PyErr_Format(PyExc_TypeError, "a CDF has no values of NumPy's type %S", type.ptr());
  throw nb::python_error();
}

/// The elements of an array where they are.
Converted lent(const nb::object& array) {
  PyArrayObject* const source = arrayOf(array);
  const std::optional<ClassId> classId = classOf(source);
  if (!classId) refuseType(source);
  std::vector<std::size_t> sizes(PyArray_DIMS(source), PyArray_DIMS(source) + PyArray_NDIM(source));
  if (sizes.empty()) sizes = {1, 1};
  const std::span elements(static_cast<const std::byte*>(PyArray_DATA(source)),
                           static_cast<std::size_t>(PyArray_NBYTES(source)));
  return {Array::borrowed(*classId, sizes, elements), array};
}

Converted anyArray(nb::handle value, int type = NPY_NOTYPE) {
  nb::object array = inModuleOrder(value, type);
  if (PyArray_TYPE(arrayOf(array)) == NPY_UNICODE) {
    const nb::object encode = nb::module_::import_("numpy").attr("char").attr("encode");
    array = inModuleOrder(encode(array, "utf-8", "surrogateescape"));
  }
  if (PyArray_TYPE(arrayOf(array)) == NPY_STRING) return texts(arrayOf(array));
  return lent(array);
}

/// An integer or a double; nothing for other objects, among them `bool` and other classes.
std::optional<double> plainNumber(nb::handle value) {
  if (PyFloat_Check(value.ptr())) return PyFloat_AsDouble(value.ptr());
  if (PyBool_Check(value.ptr()) || !PyIndex_Check(value.ptr()) || isArray(value)) return {};
  const nb::object integer = orThrow(PyNumber_Index(value.ptr()));
  const double number = PyLong_AsDouble(integer.ptr());
  if (number == -1.0 && PyErr_Occurred() != nullptr) throw nb::python_error();
  return number;
}

bool isSequence(nb::handle value) {
  return PyList_Check(value.ptr()) || PyTuple_Check(value.ptr());
}

/// The numbers of a list or tuple; nothing when something else is in it.
std::optional<std::vector<double>> plainNumbers(nb::handle value) {
  std::vector<double> numbers;
  for (const nb::handle item : nb::borrow<nb::sequence>(value)) {
    const std::optional<double> number = plainNumber(item);
    if (!number) return {};
    numbers.push_back(*number);
  }
  return numbers;
}

Converted numberOr(nb::handle value) {
  if (const std::optional<double> number = plainNumber(value)) return {Array::scalar(*number), {}};
  return isText(value) ? Converted{narrowText(value), {}} : anyArray(value);
}

Converted numbers(nb::handle value) {
  if (!isSequence(value)) return numberOr(value);
  const std::optional<std::vector<double>> plain = plainNumbers(value);
  if (!plain) return anyArray(value);
  if (plain->empty()) return {Array::zeros(ClassId::kDouble, {0, 0}), {}};
  return {Array::row(std::span<const double>(*plain)), {}};
}

Converted constantNamed(nb::handle name) {
  static const Array* const kCommand = new Array(Array::fromNarrow("getConstantValue"));
  const Array given = narrowText(name);
  const ArrayView arguments[] = {given};
  return {std::move(callCommand(*kCommand, arguments).front()), {}};
}

Converted identifier(nb::handle value) {
  if (!PyLong_Check(value.ptr()) || PyBool_Check(value.ptr())) return anyArray(value);
  const std::uint64_t number = PyLong_AsUnsignedLongLong(value.ptr());
  if (PyErr_Occurred() == nullptr) return {Array::scalar(number), {}};
  PyErr_Clear();  // no identifier is negative or that large
  return {Array::scalar(std::uint64_t{0}), {}};
}

}  // namespace

Converted convertArgument(ArgumentKind kind, nb::handle value) {
  switch (kind) {
    case ArgumentKind::kFile:
      return identifier(value);
    case ArgumentKind::kNamed:
      return isText(value) ? constantNamed(value) : numberOr(value);
    case ArgumentKind::kNumber:
      return numberOr(value);
    case ArgumentKind::kNumbers:
    case ArgumentKind::kVariances:
      return numbers(value);
    case ArgumentKind::kFileName:
      return fileName(value);
    case ArgumentKind::kTimes:
      return anyArray(value, isArray(value) || isText(value) ? NPY_NOTYPE : NPY_DOUBLE);
    case ArgumentKind::kText:
    case ArgumentKind::kValue:
      break;
  }
  if (isText(value)) return {narrowText(value), {}};
  if (PyFloat_CheckExact(value.ptr())) return {Array::scalar(PyFloat_AsDouble(value.ptr())), {}};
  return anyArray(value);
}

}  // namespace ambrix::python
