// Lists the variables of a CDF file, with the first values of each.
//
// usage: list_variables FILE

#include <ambrix/embedded.h>

#include <algorithm>
#include <cstddef>
#include <exception>
#include <iostream>
#include <limits>
#include <span>
#include <sstream>
#include <string>

namespace {

using ambrix::Array;
using ambrix::ArrayView;

constexpr std::size_t kValuesShown = 4;

/// The first of some numbers.
template <typename T>
std::string firstNumbers(std::span<const T> values) {
  std::ostringstream text;
  text.precision(std::numeric_limits<T>::digits10);
  const auto shown = values.first(std::min(values.size(), kValuesShown));
  for (const T value : shown)
    text << ' ' << +value;  // the sign makes a number of an int8
  if (shown.size() < values.size()) text << " ...";
  return text.str();
}

/// The first of some texts. Characters are the first dimension; each holds one byte of the file.
std::string firstText(std::span<const char16_t> characters, std::size_t length) {
  const auto text = characters.first(std::min(characters.size(), length));
  return " \"" + std::string(text.begin(), text.end()) + '"';
}

std::string firstValues(ArrayView values, std::size_t textLength) {
  return visit(values,
               ambrix::Overloaded{
                   [](ArrayView cells) { return std::string(cells.className()); },
                   [&](std::span<const char16_t> text) { return firstText(text, textLength); },
                   [](auto numbers) { return firstNumbers(numbers); }});
}

double number(ArrayView array) {
  return array.data<double>()[0];
}

/// "Flux: cdf_real4, 2 records of 3x2: 1 3 5 2 ..."
std::string describe(ambrix::Module& module, ArrayView file, ArrayView variable) {
  const auto definition = module.call("inquireVar", {file, variable});
  const double lastRecord = number(module.call("getVarMaxWrittenRecNum", {file, variable})[0]);
  std::ostringstream line;
  line << definition[0].utf8() << ": " << definition[1].utf8() << ", " << lastRecord + 1
       << (lastRecord == 0 ? " record" : " records");

  const char* separator = " of ";
  for (const double size : definition[3].data<double>()) {
    line << separator << size;
    separator = "x";
  }
  if (lastRecord >= 0) {
    const auto values = module.call("getVarRecordData", {file, variable, Array::scalar(0.0)});
    const auto textLength = static_cast<std::size_t>(number(definition[2]));
    line << ':' << firstValues(values[0], textLength);
  }
  return line.str();
}

void listVariables(const char* path) {
  ambrix::Module module;
  const auto opened = module.call("open", {Array::fromUtf8(path)});
  const ArrayView file = opened[0];
  const double variables = number(module.call("inquire", {file})[3]);
  for (double variable = 0; variable < variables; ++variable) {
    try {
      std::cout << describe(module, file, Array::scalar(variable)) << '\n';
    } catch (const ambrix::Error& error) {  // a datatype that is not supported, for example
      std::cout << "variable " << variable << ": " << error.what() << '\n';
    }
  }
  module.call("close", {file});
}

}  // namespace

int main(int argumentCount, char** arguments) {
  if (argumentCount != 2) {
    std::cerr << "usage: list_variables FILE\n";
    return 2;
  }
  try {
    listVariables(arguments[1]);
    return 0;
  } catch (const std::exception& error) {
    std::cerr << "list_variables: " << error.what() << '\n';
    return 1;
  }
}
