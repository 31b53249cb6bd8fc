// The functions of the commands: plain functions of CPython's, which cost less than nanobind's.
#include <array>
#include <cmath>
#include <utility>

#include "src/arguments.h"
#include "src/library.h"
#include "src/messages.h"
#include "src/results.h"
#include "src/rows.h"
#include "src/startup.h"

namespace nb = nanobind;

namespace ambrix::python {
namespace {

using Given = std::array<PyObject*, kMostArguments>;

/// What is made of a row once.
struct Prepared {
  Array command;
  std::array<PyObject*, kMostArguments> names{};
};

/// As long as the process, since Python ends after all destructors.
std::array<Prepared, kRowCount>& prepared() {
  static auto* const rows = new std::array<Prepared, kRowCount>;
  return *rows;
}

[[noreturn]] void refuse(const char* format, const Row& row, const char* name) {
  PyErr_Format(PyExc_TypeError, format, row.name, name);
  throw nb::python_error();
}

std::size_t placeOf(const Row& row, const Prepared& made, PyObject* name) {
  for (std::size_t i = 0; i < row.argumentCount; ++i) {
    if (made.names[i] == name || PyUnicode_Compare(made.names[i], name) == 0) return i;
  }
  refuse("%s() got an unexpected keyword argument '%s'", row, nb::str(name).c_str());
}

void placeKeywords(const Row& row, const Prepared& made, PyObject* const* values, PyObject* names,
                   Given& given) {
  const Py_ssize_t count = names == nullptr ? 0 : PyTuple_Size(names);
  for (Py_ssize_t i = 0; i < count; ++i) {
    const std::size_t place = placeOf(row, made, PyTuple_GetItem(names, i));
    if (given[place] != nullptr) {
      refuse("%s() got multiple values for argument '%s'", row, row.arguments[place].name);
    }
    given[place] = values[i];
  }
}

/// Puts arguments at their places, as Python does. Returns how many there are.
std::size_t placeArguments(const Row& row, const Prepared& made, PyObject* const* values,
                           std::size_t positional, PyObject* names, Given& given) {
  if (positional > row.argumentCount) refuse("%s() got too many arguments%s", row, "");
  std::copy_n(values, positional, given.begin());
  placeKeywords(row, made, values + positional, names, given);
  for (std::size_t i = 0; i < row.required; ++i) {
    if (given[i] == nullptr) refuse("%s() misses the argument '%s'", row, row.arguments[i].name);
  }
  std::size_t count = row.argumentCount;
  while (count > row.required && (given[count - 1] == nullptr || given[count - 1] == Py_None))
    --count;
  return count;
}

double productOf(ArrayView numbers) {
  double product = 1;
  visit(numbers, Overloaded{[](ArrayView) {},
                            [&product](auto values) {
                              for (const auto value : values)
                                product *= std::trunc(static_cast<double>(value));
                            }});
  return product;
}

/// The dimensions of what "hyperGetVarData" has read: the counts, the records and, where values
/// are made of several elements, these.
std::size_t dimensionsOf(ArrayView block, std::span<const ArrayView> arguments) {
  const ArrayView records = arguments[3];
  const ArrayView counts = arguments[6];
  const double values = productOf(counts) * productOf(records);
  const bool several =
      block.classId() == ClassId::kChar || static_cast<double>(block.elementCount()) > values;
  return counts.elementCount() + (several ? 2 : 1);
}

nb::object packed(const Row& row, std::vector<Array>& results,
                  std::span<const ArrayView> arguments) {
  if (row.resultCount == 0) return nb::none();
  if (row.results[0] == ResultKind::kBlock) {
    const std::size_t dimensions = dimensionsOf(results.at(0), arguments);
    return convertResult(ResultKind::kBlock, std::move(results[0]), dimensions);
  }
  if (row.resultCount == 1) return convertResult(row.results[0], std::move(results.at(0)));
  nb::object tuple = nb::steal(PyTuple_New(static_cast<Py_ssize_t>(row.resultCount)));
  for (std::size_t i = 0; i < row.resultCount; ++i) {
    nb::object item = convertResult(row.results[i], std::move(results.at(i)));
    PyTuple_SetItem(tuple.ptr(), static_cast<Py_ssize_t>(i), item.release().ptr());
  }
  return tuple;
}

nb::object call(const Row& row, const Prepared& made, PyObject* const* values,
                std::size_t positional, PyObject* names) {
  Given places{};
  const std::size_t count = placeArguments(row, made, values, positional, names, places);
  std::array<Converted, kMostArguments> converted;
  std::array<ArrayView, kMostArguments> arguments;
  for (std::size_t i = 0; i < count; ++i) {
    converted[i] = convertArgument(row.arguments[i].kind, places[i]);
    arguments[i] = converted[i].array;
  }
  const std::span<const ArrayView> given = std::span(arguments).first(count);
  std::vector<Array> results = callCommand(made.command, given);
  return packed(row, results, given);
}

/// CPython tells a function nothing that it could find its row by: so there is one for each row.
template <std::size_t kRow>
PyObject* callRow(PyObject*, PyObject* const* values, Py_ssize_t positional, PyObject* names) {
  try {
    return call(kRows[kRow], prepared()[kRow], values, static_cast<std::size_t>(positional), names)
        .release()
        .ptr();
  } catch (...) {
    setErrorFromException();
    return nullptr;
  }
}

template <std::size_t... kRow>
std::array<PyMethodDef, kRowCount + 1> makeMethods(std::index_sequence<kRow...>) {
  constexpr int kFlags = METH_FASTCALL | METH_KEYWORDS;
  return {{{kRows[kRow].name,
            reinterpret_cast<PyCFunction>(reinterpret_cast<void (*)()>(callRow<kRow>)), kFlags,
            kRows[kRow].doc}...,
           {}}};
}

void prepare(const Row& row, Prepared& made) {
  made.command = Array::fromNarrow(row.name);
  for (std::size_t i = 0; i < row.argumentCount; ++i)
    made.names[i] = PyUnicode_InternFromString(row.arguments[i].name);
}

}  // namespace

nb::object makeCommands() {
  static auto methods = makeMethods(std::make_index_sequence<kRowCount>());
  for (std::size_t i = 0; i < kRowCount; ++i)
    prepare(kRows[i], prepared()[i]);
  // Functions are pickled by the name of their module.
  nb::object commands = nb::steal(PyModule_New("ambrix.commands"));
  if (PyModule_AddFunctions(commands.ptr(), methods.data()) != 0) throw nb::python_error();
  return commands;
}

}  // namespace ambrix::python
