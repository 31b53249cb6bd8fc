// Errors and warnings in Python.
#pragma once

#include <nanobind/nanobind.h>

#include "ambrix/error.h"

namespace ambrix::python {

/// Sets Python's error from the exception that is being handled.
void setErrorFromException() noexcept;

/// Issues a warning. Throws nanobind::python_error when a filter makes an error of it.
void issueWarning(const MessageId& warning);

/// A `str` of bytes that are meant to be UTF-8; others survive as lone surrogates.
nanobind::object textOf(std::string_view bytes);

}  // namespace ambrix::python
