// Lists the variables of a CDF file, with the first values of each.
//
// usage: list_variables FILE

#include <ambrix/embedded.h>

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <exception>
#include <iostream>
#include <limits>
#include <sstream>
#include <string>
#include <string_view>

namespace {

using ambrix::Array;
using ambrix::ArrayView;
using ambrix::ClassId;

constexpr std::size_t kValuesShown = 4;

/// The first of some numbers. They are T in C++: `data` refuses another type.
template <typename T>
std::string firstNumbers(ArrayView values) {
  std::ostringstream text;
  text.precision(std::numeric_limits<T>::digits10);
  const auto shown = values.data<T>().first(std::min(values.elementCount(), kValuesShown));
  for (const T value : shown)
    text << ' ' << +value;  // the sign makes a number of an int8
  if (shown.size() < values.elementCount()) text << " ...";
  return text.str();
}

/// The first of some texts. Characters are the first dimension; each holds one byte of the file.
std::string firstText(ArrayView values, std::size_t length) {
  const std::u16string_view text = values.chars().substr(0, length);
  return " \"" + std::string(text.begin(), text.end()) + '"';
}

std::string firstValues(ArrayView values, std::size_t textLength) {
  const ClassId held = values.classId();
  if (held == ClassId::kChar) return firstText(values, textLength);
  if (held == ClassId::kDouble) return firstNumbers<double>(values);
  if (held == ClassId::kSingle) return firstNumbers<float>(values);
  if (held == ClassId::kInt8) return firstNumbers<std::int8_t>(values);
  if (held == ClassId::kUint8) return firstNumbers<std::uint8_t>(values);
  if (held == ClassId::kInt16) return firstNumbers<std::int16_t>(values);
  if (held == ClassId::kUint16) return firstNumbers<std::uint16_t>(values);
  if (held == ClassId::kInt32) return firstNumbers<std::int32_t>(values);
  if (held == ClassId::kUint32) return firstNumbers<std::uint32_t>(values);
  return std::string(" of class ") + values.className();
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
