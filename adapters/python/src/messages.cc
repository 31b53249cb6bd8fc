#include "src/messages.h"

#include <new>
#include <string>
#include <variant>

#include "ambrix/file_error.h"
#include "src/numpy.h"

namespace nb = nanobind;

namespace ambrix::python {
namespace {

struct ToPython {
  nb::object operator()(std::int64_t number) const { return nb::int_(number); }
  nb::object operator()(const std::string& text) const { return textOf(text); }
  nb::object operator()(const std::u16string& text) const {
    int order = -1;
    return orThrow(PyUnicode_DecodeUTF16(reinterpret_cast<const char*>(text.data()),
                                         static_cast<Py_ssize_t>(2 * text.size()), "surrogatepass",
                                         &order));
  }
};

nb::tuple valuesOf(const MessageId& message) {
  nb::list values;
  for (const MessageArg& value : message.values)
    values.append(std::visit(ToPython(), static_cast<const MessageArg::variant&>(value)));
  return nb::tuple(values);
}

/// An exception of a class of `ambrix.errors`.
nb::object exceptionOf(const char* className, const MessageId& message) {
  const nb::object type = nb::module_::import_("ambrix.errors").attr(className);
  return type(textOf(messageText(message)), textOf(message.fullIdentifier()), valuesOf(message));
}

void setError(const Error& error) {
  const bool memory = error.identifier() == "TOLVEX:host:outOfMemory";
  const nb::object exception = exceptionOf(memory ? "OutOfMemoryError" : "Error", error.id());
  PyErr_SetObject(exception.type().ptr(), exception.ptr());
}

void setFileError(const FileError& error) {
  const nb::object type = nb::module_::import_("ambrix.errors").attr("Error");
  const nb::object exception = type(textOf(error.what()), textOf(error.identifier()));
  PyErr_SetObject(type.ptr(), exception.ptr());
}

void setErrorOf(const std::exception_ptr& failure) {
  try {
    std::rethrow_exception(failure);
  } catch (nb::python_error& error) {
    error.restore();
  } catch (const Error& error) {
    setError(error);
  } catch (const FileError& error) {
    setFileError(error);
  } catch (const std::bad_alloc&) {
    PyErr_NoMemory();
  } catch (const std::exception& error) {
    PyErr_SetString(PyExc_RuntimeError, error.what());
  } catch (...) {
    PyErr_SetString(PyExc_RuntimeError, "an exception of an unknown type");
  }
}

}  // namespace

nb::object textOf(std::string_view bytes) {
  return orThrow(
      PyUnicode_DecodeUTF8(bytes.data(), static_cast<Py_ssize_t>(bytes.size()), "surrogateescape"));
}

void setErrorFromException() noexcept {
  try {
    setErrorOf(std::current_exception());
  } catch (nb::python_error& error) {
    error.restore();  // of making the error
  } catch (...) {
    PyErr_NoMemory();
  }
}

void issueWarning(const MessageId& warning) {
  nb::module_::import_("warnings").attr("warn")(exceptionOf("CdfWarning", warning));
}

}  // namespace ambrix::python
