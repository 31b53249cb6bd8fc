#include "src/results.h"

#include <cstring>
#include <memory>
#include <string>
#include <vector>

#include "ambrix/texts.h"
#include "src/messages.h"
#include "src/numpy.h"

namespace nb = nanobind;

namespace ambrix::python {
namespace {

using Shape = std::vector<npy_intp>;

constexpr std::size_t kFewBytes = 256;  // which are copied sooner than kept

void freeElements(PyObject* capsule) {
  delete static_cast<OwnedElements*>(PyCapsule_GetPointer(capsule, nullptr));
}

nb::object newArray(const Shape& shape, int type, int itemBytes, void* data) {
  auto* dims = const_cast<npy_intp*>(shape.data());
  return orThrow(PyArray_New(&PyArray_Type, static_cast<int>(shape.size()), dims, type, nullptr,
                             data, itemBytes, NPY_ARRAY_FARRAY, nullptr));
}

/// A NumPy array over the memory of a result.
nb::object arrayOver(OwnedElements elements, const Shape& shape, int type, int itemBytes) {
  auto owner = std::make_unique<OwnedElements>(std::move(elements));
  const nb::object capsule = orThrow(PyCapsule_New(owner.get(), nullptr, freeElements));
  nb::object array = newArray(shape, type, itemBytes, owner.release()->get());
  if (PyArray_SetBaseObject(arrayOf(array), capsule.inc_ref().ptr()) != 0) throw nb::python_error();
  return array;
}

nb::object numbers(Array&& result, const Shape& shape) {
  const int type = numpyTypeOf(result.classId());
  const std::span bytes = result.bytes();
  if (bytes.size() > kFewBytes) return arrayOver(result.releaseElements(), shape, type, 0);
  nb::object array = newArray(shape, type, 0, nullptr);
  if (!bytes.empty()) std::memcpy(PyArray_DATA(arrayOf(array)), bytes.data(), bytes.size());
  return array;
}

/// Texts as bytes of one length each, in the memory of the characters.
nb::object texts(Array&& result, Shape shape) {
  const auto length = static_cast<int>(shape.front());
  shape.erase(shape.begin());
  const std::size_t count = result.elementCount();
  if (count == 0) return newArray(shape, NPY_STRING, length, nullptr);
  OwnedElements elements = result.releaseElements();
  // A byte is never written behind the unit that is still to be read.
  auto* const bytes = static_cast<char*>(elements.get());
  for (std::size_t i = 0; i < count; ++i) {
    char16_t unit = 0;
    std::memcpy(&unit, bytes + 2 * i, 2);
    bytes[i] = static_cast<char>(unit);
  }
  return arrayOver(std::move(elements), shape, NPY_STRING, length);
}

nb::object inShape(Array&& result, const Shape& shape) {
  if (result.classId() == ClassId::kChar) return texts(std::move(result), shape);
  nb::object array = numbers(std::move(result), shape);
  if (!shape.empty()) return array;
  return orThrow(PyArray_Return(arrayOf(array.release())));  // a scalar
}

Shape sizesOf(ArrayView result) {
  return {result.size().begin(), result.size().end()};
}

nb::object withoutTrailing(Array&& result) {
  Shape shape = sizesOf(result);
  while (!shape.empty() && shape.back() == 1)
    shape.pop_back();
  const bool isChar = result.classId() == ClassId::kChar;
  if (isChar && shape.size() <= 1) return textOf(bytesOf(result));
  return inShape(std::move(result), shape);
}

nb::object row(Array&& result) {
  if (result.classId() == ClassId::kChar) return textOf(bytesOf(result));
  Shape shape = sizesOf(result);
  if (shape.front() == 1) shape.erase(shape.begin());
  return inShape(std::move(result), shape);
}

/// Sizes of 1 at the end are not in the result's own.
nb::object block(Array&& result, std::size_t dimensions) {
  Shape shape = sizesOf(result);
  shape.resize(dimensions, 1);
  return inShape(std::move(result), shape);
}

nb::object number(double value) {
  return orThrow(PyLong_FromDouble(value));
}

template <typename T>
nb::object tupleOf(ArrayView result, nb::object (*convert)(T)) {
  nb::list items;
  for (const T item : result.data<T>())
    items.append(convert(item));
  return nb::tuple(items);
}

nb::object parameter(ArrayView result) {
  if (result.elementCount() == 0) return nb::none();
  if (result.classId() == ClassId::kChar) return textOf(bytesOf(result));
  return number(result.data<double>().front());
}

nb::object listOfTexts(ArrayView cells) {
  nb::list items;
  for (std::size_t i = 0; i < cells.elementCount(); ++i)
    items.append(textOf(bytesOf(cells.element(i))));
  return items;
}

nb::object flag(bool value) {
  return nb::bool_(value);
}

}  // namespace

nb::object convertResult(ResultKind kind, Array&& result, std::size_t dimensions) {
  switch (kind) {
    case ResultKind::kIdentifier:
      return nb::int_(result.data<std::uint64_t>().front());
    case ResultKind::kNumber:
      return number(result.data<double>().front());
    case ResultKind::kText:
      return textOf(bytesOf(result));
    case ResultKind::kTexts:
      return listOfTexts(result);
    case ResultKind::kFlag:
      return flag(result.data<bool>().front());
    case ResultKind::kFlags:
      return tupleOf<bool>(result, flag);
    case ResultKind::kNumbers:
      return tupleOf<double>(result, number);
    case ResultKind::kParameter:
      return parameter(result);
    case ResultKind::kValue:
      return withoutTrailing(std::move(result));
    case ResultKind::kRow:
      return row(std::move(result));
    case ResultKind::kBlock:
      return block(std::move(result), dimensions);
    case ResultKind::kArray:
      break;
  }
  const Shape shape = sizesOf(result);
  return inShape(std::move(result), shape);
}

}  // namespace ambrix::python
